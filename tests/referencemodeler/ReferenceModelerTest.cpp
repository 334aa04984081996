// The reference modeler: ImportPart with its planned failures, Clone, its names for faces and
// edges, ExplodeBox, and the renderer it makes: the scene it draws, where, and its ids and paths.
#include "support/ReferenceModelerFixture.h"
#include "support/TestPartContainer.h"
#include <VizBridge/contracts/kolba/PolygonItem.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/modelerkit/BrepPartRenderer.h>
#include <VizBridge/referencemodeler/ReferenceBrepRenderer.h>

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <optional>
#include <stdexcept>
#include <string>
#include <thread>

namespace VizReferenceModeler {
namespace {

using Failure = ReferenceModelerServices::FailureKind;
using KolbaVizCore::Body;
using KolbaVizCore::Edge;
using KolbaVizCore::Face;
using ReferenceBrepRendererTest = ReferenceModelerScene;

TEST(ReferenceModelerImportPart, FailsAsPlannedForThePlannedReferenceOnly) {
    struct Case {
        std::optional<Failure> plan; ///< none: the document's conversion fails
        bool ok;
        char const* error;
        char const* thrown;
    };
    for (Case const& c : {Case{Failure::ReturnFalse, false, "disk full", ""},
                          Case{Failure::ReturnNullContainer, true, "", ""},
                          Case{Failure::ThrowStdException, false, "", "disk full"},
                          Case{Failure::ThrowNonStdException, false, "", "int 3"},
                          Case{std::nullopt, false, "conversion failed", ""}}) {
        SCOPED_TRACE(c.plan ? static_cast<int>(*c.plan) : -1);
        TarvexModel model = MakeModel();
        model.FindReference(PinId)->geometry.conversionFails = !c.plan;
        ReferenceModelerServices services;
        if (c.plan)
            services.PlanFailure(PinId, {*c.plan, "disk full"});
        Imported imported;
        std::string thrown;
        try {
            imported = Import(services, model, PinId);
        } catch (std::exception const& e) {
            thrown = e.what();
        } catch (int id) {
            thrown = "int " + std::to_string(id);
        }
        EXPECT_TRUE(imported.ok == c.ok && !imported.container);
        EXPECT_EQ(VizPort::Narrow(imported.error), c.error);
        EXPECT_EQ(thrown, c.thrown);
        EXPECT_NE(Import(services, model, BoltId).part(), nullptr) << "an unplanned part";
        services.ClearFailure(PinId);
        EXPECT_EQ(Import(services, model, PinId).part() != nullptr, c.plan.has_value());
        EXPECT_EQ(services.GetImportCalls().size(), 3u) << "a failing call is recorded too";
        EXPECT_EQ(services.GetImportCalls()[0].thread, std::this_thread::get_id());
    }
    ReferenceModelerServices services;
    EXPECT_EQ(Import(services, MakeModel(), 9).error, u"no part document") << "no such reference";
}

TEST_F(ReferenceModelerScene, ImportsThePartsFacesAndEdgesWithItsPMIAndClonesItsPlan) {
    ASSERT_TRUE(pin.ok && pin.error.empty() && pin.part());
    ReferencePartContainer const& part = *pin.part();
    EXPECT_EQ(part.GetTypeName(), "Reference BREP Container");
    EXPECT_TRUE(part.GetName() == u"Pin" && part.GetRefID() == 3 && part.IsModelerDataValid());
    EXPECT_TRUE(part.FindFace(102) && part.FindFace(102)->positions.size() == 9u);
    EXPECT_TRUE(part.FindEdge(202) && part.FindEdge(202)->points.size() == 9u);
    EXPECT_FALSE(part.FindFace(201) || part.FindEdge(101)) << "faces and edges keep apart";
    EXPECT_EQ(pin.result.GetPMIData().GetReferenceId(), PinId);

    ReferenceModelerServices original(u"Host Modeler");
    original.PlanFailure(PinId, {Failure::ReturnFalse, "planned"});
    Import(original, model, BoltId);
    std::unique_ptr<VizBridgeTarvex::VizModelerServices> const copy(original.Clone());
    auto& clone = dynamic_cast<ReferenceModelerServices&>(*copy);
    EXPECT_TRUE(clone.GetName() == u"Host Modeler" && clone.GetImportCalls().size() == 1u);
    EXPECT_EQ(Import(clone, model, PinId).error, u"planned");
    clone.ClearFailures();
    EXPECT_NE(Import(clone, model, PinId).part(), nullptr);
    EXPECT_EQ(Import(original, model, PinId).error, u"planned") << "the original keeps its plan";
    EXPECT_EQ(original.GetImportCalls().size(), 2u) << "the clone's calls are its own";
}

TEST_F(ReferenceModelerScene, NamesTheFacesEdgesAndBodyOfItsOwnPartOnly) {
    VizPartContainer* const p = pin.container.get();
    VizBridgeTarvex::TestPartContainer foreign(u"Foreign", PinId);
    auto const named = [](std::optional<EntityId> const& expected, bool found, EntityId const& id) {
        // An answer of false leaves the entity untouched.
        EXPECT_EQ(found, expected.has_value());
        EXPECT_EQ(id.IsValid() ? std::optional(id) : std::nullopt, expected);
    };
    for (auto const& [id, expected] : {std::pair{102u, std::optional(EntityId(PinId, Face, 102))},
                                       std::pair{999u, std::optional<EntityId>()}}) {
        TarvexEntity entity = model.MakeEntity({1}, id); // through the instance Pin.1
        EntityId out;
        named(expected, services.GetEntityId(p, entity, out), out);
    }
    TarvexAuthoredPMIAnnotation linked;
    linked.linkedElements = {TarvexAuthoredEntity{{1}, 201, std::nullopt, true}};
    TarvexPMIAnnotation annotation = model.MakePMIObject<TarvexPMIAnnotation>(linked);
    for (std::optional<int> index :
         {std::optional(0), std::optional(1), std::optional(-1), std::optional<int>()}) {
        EntityId out;
        named(index == 0 ? std::optional(EntityId(PinId, Edge, 201)) : std::nullopt,
              services.GetAnnotationEntityId(p, annotation, index ? &*index : nullptr, out), out);
    }

    // A pick: the caller fills the parent id from the body tag of the picked path.
    struct Pick {
        unsigned long id;
        unsigned int body;
        VizPartContainer* container;
        std::optional<EntityId> expected;
    };
    for (Pick const& c : {
             Pick{101, PinId, p, EntityId(PinId, Face, 101)},
             Pick{201, PinId, p, EntityId(PinId, Edge, 201)},
             Pick{PinId, PinId, p, EntityId(PinId, Body, PinId)},
             Pick{101, BoltId, p, std::nullopt},       // Pin's face on a path through Bolt
             Pick{BoltId, PinId, p, std::nullopt},     // Bolt's body on a path through Pin
             Pick{101, PinId, &foreign, std::nullopt}, // another modeler's container
             // 101 in the low 32 bits: a truncating lookup would find face 101.
             Pick{std::numeric_limits<std::uint32_t>::max() + 102ul, PinId, p, std::nullopt},
         }) {
        SCOPED_TRACE(c.id);
        EntityId out(c.body, 0xFFFFFFFFu, 0);
        named(c.expected, services.ConvertToEntity(c.id, c.container, out), out);
    }
}

TEST(ReferenceModelerExplodeBox, MovesTheBoxThenPushesItAwayFromTheOriginByItsCentre) {
    double const r = std::sqrt(0.5), s = std::sqrt(2.0), none[3] = {0, 0, 0};
    double const quarterZ[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}}; // x to y, y to -x
    double const eighthZ[3][3] = {{r, -r, 0}, {r, r, 0}, {0, 0, 1}}, moved[3] = {10, -20, 30};
    double const identity[3][3] = {{1, 0, 0}, {0, 1, 0}, {0, 0, 1}};
    VizTransf const shifted(identity, moved), quarter(quarterZ, none), eighth(eighthZ, none);
    struct Case {
        VizTransf transformation;
        VizBox box;
        double factors[3];
        VizBox expected;
    };
    Case const cases[] = {
        {shifted, Box(0, 0, 0, 1, 2, 3), {0, 0, 0}, Box(10, -20, 30, 11, -18, 33)},
        {quarter, Box(1, 0, 0, 2, 1, 1), {0, 0, 0}, Box(-1, 1, 0, 0, 2, 1)},
        // The corners of the square land on the axes: the moved box needs all of them.
        {eighth, Box(-1, -1, 0, 1, 1, 1), {0, 0, 0}, Box(-s, -s, 0, s, s, 1)},
        {VizTransf(), Box(-1, 3, -3, 1, 5, -1), {5, 0.5, 2}, Box(-1, 5, -7, 1, 7, -5)},
        {quarter, Box(9, -1, -1, 11, 1, 1), {1, 1, 1}, Box(-1, 19, -1, 1, 21, 1)},
        {shifted, VizBox(), {1, 2, 3}, VizBox()},
    };
    ReferenceModelerServices services;
    for (Case const& c : cases) {
        SCOPED_TRACE(&c - cases);
        VizBox const exploded =
            services.ExplodeBox(c.transformation, c.box, c.factors[0], c.factors[1], c.factors[2]);
        ASSERT_EQ(exploded.IsEmpty(), c.expected.IsEmpty());
        for (int axis = 0; axis < 3 && !exploded.IsEmpty(); ++axis) {
            EXPECT_NEAR(exploded.GetLow()[axis], c.expected.GetLow()[axis], 1e-12) << axis;
            EXPECT_NEAR(exploded.GetHigh()[axis], c.expected.GetHigh()[axis], 1e-12) << axis;
        }
    }
}

TEST_F(ReferenceBrepRendererTest, DrawsTheBodyWithItsFacesAndEdgesBelowTheCurrentNode) {
    bool drawn[3] = {};
    auto const pins = Draw(pin.container.get(), 1000, drawn[0]);
    builder.SetGeometryItemFactory(nullptr);
    auto const bolts = Draw(bolt.container.get(), 1001, drawn[1]);
    EXPECT_EQ(builder.Dump(), "1 scene \"ROOT\"\n"
                              "  77 level \"Product\"\n"
                              "    1000 level \"Instance\"\n"
                              "      10011 level \"BrepPart\"\n"
                              "        1 level \"Brep\"\n"
                              "          10003 type \"Bodies\"\n"
                              "            3 body \"Body3\"\n"
                              "              10002 type \"Faces\"\n"
                              "                101 entity \"Face101\" {polygon#101 mode=1 n=6}\n"
                              "                102 entity \"Face102\" {polygon#102 mode=1 n=3}\n"
                              "              10001 type \"Edges\"\n"
                              "                201 entity \"Edge201\" {polyline#201 pts=2}\n"
                              "                202 entity \"Edge202\" {polyline#202 pts=3}\n"
                              "    1001 level \"Instance\"\n"
                              "      10011 level \"BrepPart\"\n"
                              "        1 level \"Brep\"\n"
                              "          10003 type \"Bodies\"\n"
                              "            4 body \"Body4\"\n"
                              "              10002 type \"Faces\"\n"
                              "                101 entity \"Face101\"\n");
    auto const& face = dynamic_cast<KolbaVizCore::PolygonItem const&>(
        *builder.FindNode(InPart(1000, PinId, {Face, 102}))->GetItem(0));
    EXPECT_EQ(face.GetNormals(), (std::vector<float>{0, 0, 1, 0, 0, 1, 0, 0, 1}))
        << "the triangle's normal at each corner";

    float box[6], center[3];
    pins->GetGeometryBox(box);
    pins->GetGeometryCenter(center);
    EXPECT_EQ(std::vector<float>(box, box + 6), (std::vector<float>{0, 0, 0, 2, 1, 3}));
    EXPECT_EQ(std::vector<float>(center, center + 3), (std::vector<float>{1, 0.5f, 1.5f}));
    EXPECT_FLOAT_EQ(pins->GetGeometryRadius(), static_cast<float>(std::sqrt(14.0) / 2.0));
    ReferencePartContainer empty(u"Empty", 9, nullptr);
    auto const nothing = Draw(&empty, 1002, drawn[2]);
    nothing->GetGeometryBox(box);
    EXPECT_TRUE(drawn[0] && drawn[1] && drawn[2]) << "also a part without faces and edges";
    EXPECT_TRUE(box[0] > box[3] && nothing->GetGeometryRadius() == 0.0f) << "no points";
}

TEST_F(ReferenceBrepRendererTest, ConvertsPathsAndEntitiesOfItsOwnDrawingBothWays) {
    bool drawn = false, boltDrawn = false;
    auto const renderer = Draw(pin.container.get(), 1000, drawn);
    auto const bolts = Draw(bolt.container.get(), 1002, boltDrawn);
    ASSERT_TRUE(drawn && boltDrawn && Reference(1001, renderer->GetRenderId()));
    struct Case {
        RenderId path;
        std::optional<EntityId> entity;
    };
    Case const cases[] = {
        {InPart(1000, PinId, {Face, 102}), EntityId(PinId, Face, 102)},
        {InPart(1000, PinId, {Edge, 202}), EntityId(PinId, Edge, 202)},
        {InPart(1000, PinId), EntityId(PinId, Body, PinId)},
        {InPart(1000, PinId, {Edge}), EntityId(PinId, Body, PinId)}, // the level of the edges
        {InstancePath(1000, {ReferenceBrepRenderer::PartTag, 1, Body}), std::nullopt},
        {InPart(1003, PinId, {Face, 101}), std::nullopt},  // an instance that shows no part
        {InPart(1002, BoltId, {Face, 101}), std::nullopt}, // another part's face of the id
        {InPart(1000, PinId, {Face, 201}), std::nullopt},  // an edge id below the faces
        {InPart(1000, PinId, {Face, 101, 1}), std::nullopt},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(&c - cases);
        EntityId entity;
        EXPECT_EQ(renderer->Convert(c.path, entity), c.entity.has_value());
        EXPECT_EQ(entity.IsValid() ? std::optional(entity) : std::nullopt, c.entity);
        if (!c.entity)
            continue;
        RenderId back;
        ASSERT_TRUE(renderer->Convert(*c.entity, back));
        EXPECT_TRUE(back.GetLeading() == 1u && back[0] == 1000u) << "from the root instance";
        auto const& drawing = dynamic_cast<VizModelerKit::BrepPartRenderer const&>(*renderer);
        EXPECT_EQ(builder.FindNode(drawing.InScene(back)),
                  builder.FindNode(c.entity->GetType() == Body ? InPart(1000, PinId) : c.path));
    }
    EntityId entity;
    EXPECT_TRUE(renderer->Convert(InPart(1001, PinId, {Face, 102}), entity) &&
                entity == EntityId(PinId, Face, 102))
        << "through the referencing node";
    for (EntityId const& other :
         {EntityId(BoltId, Face, 101), EntityId(PinId, Face, 201), EntityId(PinId, Body, 101)}) {
        RenderId path;
        EXPECT_FALSE(renderer->Convert(other, path) || !path.IsEmpty()) << other.GetId();
    }

    RenderId* raw = nullptr;
    int count = 0;
    EXPECT_FALSE(renderer->ConvertToHighlight(InstancePath(1000), raw, count) || raw || count);
    ASSERT_TRUE(renderer->ConvertToHighlight(InPart(1001, PinId, {Edge, 201}), raw, count));
    std::unique_ptr<RenderId[]> const ids(raw); // the caller's, released as an array
    EXPECT_TRUE(count == 1 && ids[0].GetTags() == InPart(1001, PinId, {Edge, 201}).GetTags());
}

TEST_F(ReferenceBrepRendererTest, ARefusedLevelLeavesOutWhatItWouldHold) {
    // The ids of the body (3), face 101 and edges 201 and 202 that still have a node.
    for (auto const& [refused, rendered, ids] :
         {std::tuple{"BrepPart", false, ""}, std::tuple{"Brep", true, ""},
          std::tuple{"Faces", true, "3 201 202 "}, std::tuple{"Edge201", true, "3 101 202 "}}) {
        SCOPED_TRACE(refused);
        ASSERT_TRUE(builder.Clear());
        builder.FailContextsNamed(VizPort::Widen(refused));
        bool drew = false;
        auto const renderer = Draw(pin.container.get(), 1000, drew);
        builder.ClearContextFaults();
        EXPECT_EQ(drew, rendered);
        EXPECT_EQ(renderer->GetRenderId().IsEmpty(), !rendered) << "nothing to record";
        std::string drawn;
        RenderId path;
        for (EntityId const& entity : {EntityId(PinId, Body, PinId), EntityId(PinId, Face, 101),
                                       EntityId(PinId, Edge, 201), EntityId(PinId, Edge, 202)})
            drawn += renderer->Convert(entity, path) ? std::to_string(entity.GetId()) + ' ' : "";
        EXPECT_EQ(drawn, ids);
    }
}

TEST_F(ReferenceBrepRendererTest, DrawsOnceUntilClearedAndOnlyBelowItsOwnFreeNode) {
    bool rendered = false;
    std::unique_ptr<KolbaVizCore::ARenderer> renderer = Draw(pin.container.get(), 1000, rendered);
    RenderId const part = renderer->GetRenderId();
    ASSERT_TRUE(rendered && Reference(1001, part));
    std::string const once = builder.Dump();
    EXPECT_TRUE(RenderAt(*renderer, 1000)) << "the drawing stands";
    EXPECT_TRUE(Draw(pin.container.get(), 1000, rendered)->GetRenderId().IsEmpty());
    EXPECT_FALSE(rendered) << "another drawing of a part stands there";
    EXPECT_EQ(builder.Dump(), once) << "no face is drawn twice";

    renderer->ClearAll();
    renderer->ClearAll(); // nothing left to remove
    EXPECT_EQ(builder.Dump(), "1 scene \"ROOT\"\n"
                              "  77 level \"Product\"\n"
                              "    1000 level \"Instance\"\n"
                              "    1001 level \"Instance\"\n");
    float box[6];
    renderer->GetGeometryBox(box);
    EXPECT_TRUE(renderer->GetRenderId().IsEmpty() && box[0] > box[3]);
    ASSERT_TRUE(RenderAt(*renderer, 1000)) << "cleared, it draws again";
    EXPECT_EQ(renderer->GetRenderId().GetTags(), part.GetTags());

    RenderId first = InstancePath(1000);
    std::unique_ptr<KolbaVizCore::ARenderer> const placed(
        services.CreateRenderer(pin.container.get(), &builder, &first));
    std::unique_ptr<KolbaVizCore::ARenderer> const anywhere(
        services.CreateRenderer(pin.container.get(), &builder, nullptr));
    EXPECT_FALSE(placed->Render()) << "no current node";
    EXPECT_FALSE(RenderAt(*placed, 1002)) << "another node is current";
    EXPECT_TRUE(RenderAt(*anywhere, 1002)) << "made without a path, it draws where it is";
    EXPECT_EQ(anywhere->GetRenderId().GetTags(), InstancePath(1002, {10011}).GetTags());
    VizBridgeTarvex::TestPartContainer foreign(u"Foreign", PinId);
    EXPECT_FALSE(services.CreateRenderer(nullptr, &builder, &first) ||
                 services.CreateRenderer(&foreign, &builder, &first) ||
                 services.CreateRenderer(pin.container.get(), nullptr, &first));
}

} // namespace
} // namespace VizReferenceModeler
