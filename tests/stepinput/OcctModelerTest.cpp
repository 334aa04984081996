// The Open CASCADE modeler on the NIST CTC 01 model, imported on the BREP road and drawn by the
// product renderer: faces under the tessellated road's ids and facing out, a pick named back to
// its face, an edge and the body; failures, ExplodeBox, and the spooler's road on an assembly.
#include "StepTestFiles.h"
#include "support/TestPartContainer.h"

#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/PolygonItem.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/modelerkit/BrepPartRenderer.h>
#include <VizBridge/render/UniqueRenderer.h>
#include <VizBridge/stepinput/OcctModelerServices.h>
#include <VizBridge/stepinput/OcctPartContainer.h>

#include <BRepGProp.hxx>
#include <BRepPrimAPI_MakeCylinder.hxx>
#include <BRep_Tool.hxx>
#include <GProp_GProps.hxx>
#include <IntCurvesFace_ShapeIntersector.hxx>
#include <TopExp.hxx>
#include <TopExp_Explorer.hxx>
#include <TopoDS.hxx>
#include <gp.hxx>
#include <gp_Lin.hxx>

#include <gtest/gtest.h>

#include <map>
#include <numeric>
#include <optional>

namespace VizBridgeStep {
namespace {

using KolbaVizCore::EntityId;
using KolbaVizCore::Node;
using VizBridgeTarvex::VizBox;
using Ids = std::vector<std::uint32_t>;

/// The test files live for the whole run: the modeler shares them without owning them.
std::shared_ptr<StepDocument const> Shared(StepDocument const& step) {
    return {std::shared_ptr<void>(), &step};
}

StepDocument const& CTC1() {
    return StepTestFiles::CTC("nist_ctc_01_asme1_ap242-e1.stp");
}

/// A model imported on one road and, with a modeler, drawn. The renderer goes first.
struct Imported {
    std::unique_ptr<VizBridgeTarvex::VizProductStructure> structure;
    int processors = 0;
    KolbaVizCore::SceneBuilder scene;
    std::unique_ptr<VizBridgeTarvex::TarvexRenderer> renderer;
};

/// The BREP road with `modeler`, the tessellated one without.
std::unique_ptr<Imported> Import(StepDocument const& step, OcctModelerServices* modeler) {
    auto out = std::make_unique<Imported>();
    out->structure = StepTestFiles::Structure(step);
    TarvexInputProductStructure const input = step.Model().GetInputProductStructure();
    VizBridgeTarvex::VizBuilder builder(*out->structure, input, nullptr);
    builder.SetModelerServices(modeler);
    builder.SetImportVisu(modeler == nullptr);
    builder.ImportAndBuildPS();
    out->processors = builder.GetNumberOfProcessorsUsed();
    EXPECT_EQ(out->structure->GetErrorMessages(), std::vector<VizPort::WString>());
    out->scene.SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    out->renderer = VizBridgeTarvex::MakeUniqueRenderer(out->structure.get(), modeler, &out->scene);
    EXPECT_TRUE(modeler == nullptr || out->renderer->Render());
    return out;
}

/// The tags of the face nodes drawn below each body node, references not followed.
void FaceTags(Node const& node, std::map<std::uint32_t, Ids>& out) {
    for (std::size_t i = 0; i < node.GetChildCount(); ++i) {
        if (node.GetKind() == KolbaVizCore::ContextKind::EntityType &&
            node.GetTag() == KolbaVizCore::Face)
            out[node.GetParent()->GetTag()].push_back(node.GetChild(i)->GetTag());
        FaceTags(*node.GetChild(i), out);
    }
}

Ids OneTo(int count) {
    Ids ids(static_cast<std::size_t>(count));
    std::iota(ids.begin(), ids.end(), 1u);
    return ids;
}

gp_XYZ Point(std::vector<float> const& floats, int index) {
    return gp_XYZ(floats[3 * index], floats[3 * index + 1], floats[3 * index + 2]);
}

TEST(OcctModeler, DrawsTheFacesUnderTheTessellatedRoadsIdsAndNamesAPickedFaceEdgeAndBody) {
    TarvexScopedProcessors const caller(1, std::nullopt);
    StepPart const& part = CTC1().Parts().front();
    std::uint32_t const ref = part.referenceId;
    OcctModelerServices modeler(Shared(CTC1()));
    std::unique_ptr<Imported> const brep = Import(CTC1(), &modeler), visu = Import(CTC1(), nullptr);
    auto* const container = brep->structure->GetVizPartContainer(static_cast<int>(ref));
    ASSERT_NE(container, nullptr);
    EXPECT_EQ(container->GetTypeName(), "Open CASCADE BREP Container");
    std::map<std::uint32_t, Ids> drawn, tessellated;
    FaceTags(*brep->scene.GetScene(0), drawn);
    for (KolbaVizCore::VizFace const* const face :
         visu->structure->GetVizContainer(static_cast<int>(ref))->GetMeshes().front()->GetFaces())
        tessellated[ref].push_back(std::stoul(VizPort::Narrow(face->GetMechanicalID())));
    EXPECT_EQ(drawn, (std::map<std::uint32_t, Ids>{{ref, OneTo(117)}}));
    EXPECT_EQ(tessellated, drawn);

    // Straight down through the middle of the part: the picked triangle's node names the face
    // that Open CASCADE meets first on the exact shape.
    VizBox const box = dynamic_cast<OcctPartContainer const&>(*container).GetBox();
    KolbaVizCore::Ray ray;
    box.GetCenter(ray.origin);
    ray.origin[2] = box.GetHigh()[2] + 10, ray.direction[2] = -1;
    KolbaVizCore::RenderId path;
    double distance = 0;
    ASSERT_TRUE(brep->scene.Pick(ray, path, distance));
    IntCurvesFace_ShapeIntersector exact;
    exact.Load(part.shape, 1e-6);
    exact.Perform(gp_Lin(gp_Pnt(ray.origin[0], ray.origin[1], ray.origin[2]), -gp::DZ()), 0, 1e9);
    exact.SortResult();
    ASSERT_GE(exact.NbPnt(), 1);
    std::uint32_t const face = path[path.Length() - 1], body = path[path.Length() - 3];
    EXPECT_EQ(face, static_cast<std::uint32_t>(part.faces.FindIndex(exact.Face(1))));
    EXPECT_EQ(body, ref) << "where the product renderer reads the parent id";
    KolbaVizCore::RGBAColor shown;
    std::array<std::uint8_t, 3> const rgb = part.faceColors.at(static_cast<int>(face));
    EXPECT_TRUE(brep->scene.GetDisplayColor(path, shown) &&
                shown == KolbaVizCore::RGBAColor(rgb[0], rgb[1], rgb[2], 255));

    // Outward: the triangles enclose the solid's volume and turn to their corners' normals,
    // but for slivers of a few square micrometres, whose turn is numerical noise.
    path.SetLength(path.Length() - 1);
    Node const& faces = *brep->scene.FindNode(path);
    double volume = 0, againstNormals = 0; // mm³, mm² twice over
    for (std::size_t i = 0; i < faces.GetChildCount(); ++i) {
        auto const& item =
            dynamic_cast<KolbaVizCore::PolygonItem const&>(*faces.GetChild(i)->GetItem(0));
        for (std::array<int, 3> const& t : item.GetTriangles()) {
            gp_XYZ const a = Point(item.GetVertices(), t[0]), b = Point(item.GetVertices(), t[1]),
                         c = Point(item.GetVertices(), t[2]), turn = (b - a).Crossed(c - a);
            volume += a.Dot(b.Crossed(c)) / 6;
            gp_XYZ const normals = Point(item.GetNormals(), t[0]) + Point(item.GetNormals(), t[1]) +
                                   Point(item.GetNormals(), t[2]);
            againstNormals += turn.Dot(normals) < 0 ? turn.Modulus() : 0;
        }
    }
    GProp_GProps exactVolume;
    BRepGProp::VolumeProperties(part.shape, exactVolume);
    EXPECT_NEAR(volume, exactVolume.Mass(), 0.01 * exactVolume.Mass());
    EXPECT_LT(againstNormals, 1e-3);

    std::uint32_t const edge =
        part.EdgeId(part.edges.FindIndex(TopExp_Explorer(exact.Face(1), TopAbs_EDGE).Current()));
    path.SetLength(path.Length() - 1);
    path.AddValue(KolbaVizCore::Edge);
    path.AddValue(edge);
    EXPECT_NE(brep->scene.FindNode(path), nullptr) << "an edge of the picked face is drawn";
    VizBridgeTarvex::TestPartContainer foreign(u"Foreign", static_cast<int>(body));
    OcctPartContainer renumbered(u"Renumbered", 500, Shared(CTC1()), part, {}); // no id 500
    struct Case {
        unsigned long id;
        std::uint32_t parent; ///< the body tag of the path
        VizBridgeTarvex::VizPartContainer* container;
        std::optional<EntityId> expected;
    };
    for (Case const& c : {
             Case{face, body, container, EntityId(body, KolbaVizCore::Face, face)},
             Case{edge, body, container, EntityId(body, KolbaVizCore::Edge, edge)},
             // Every part has a face 1 and the file's first reference is 1: faces come first.
             Case{body, body, container, EntityId(body, KolbaVizCore::Face, body)},
             Case{500, 500, &renumbered, EntityId(500, KolbaVizCore::Body, 500)},
             Case{face, body + 1, container, std::nullopt}, // through another part's body
             Case{118, body, container, std::nullopt},      // one face past the last
             Case{StepPart::kEdgeIdBase, body, container, std::nullopt},
             Case{(1ul << 32) + face, body, container, std::nullopt}, // must not be truncated
             Case{face, body, &foreign, std::nullopt},
         }) {
        SCOPED_TRACE(c.id);
        EntityId entity(c.parent, 0xFFFFFFFFu, 0); // as the product renderer fills it
        EXPECT_EQ(modeler.ConvertToEntity(c.id, c.container, entity), c.expected.has_value());
        EXPECT_EQ(entity.IsValid() ? std::optional(entity) : std::nullopt, c.expected);
    }
}

TEST(OcctModeler, MeshesAFaceWithoutTrianglesOnACopyAndConvertsItsPathsBothWays) {
    StepPart part; // never meshed, as a face that the reading could not mesh
    part.shape = BRepPrimAPI_MakeCylinder(5, 10).Shape();
    TopExp::MapShapes(part.shape, TopAbs_FACE, part.faces);
    TopExp::MapShapes(part.shape, TopAbs_EDGE, part.edges);
    OcctPartContainer container(u"Cylinder", 7, nullptr, part, {});
    KolbaVizCore::SceneBuilder scene;
    scene.SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    std::unique_ptr<KolbaVizCore::ARenderer> const renderer(
        OcctModelerServices(nullptr).CreateRenderer(&container, &scene, nullptr));
    {
        KolbaVizCore::SceneContext const root(&scene, Node::RootNodeId, u"ROOT");
        ASSERT_TRUE(renderer->Render());
    }
    for (std::uint32_t const face : OneTo(part.faces.Extent())) {
        EntityId const entity(7, KolbaVizCore::Face, face);
        KolbaVizCore::RenderId path;
        EntityId back;
        ASSERT_TRUE(renderer->Convert(entity, path));
        path = dynamic_cast<VizModelerKit::BrepPartRenderer const&>(*renderer).InScene(path);
        ASSERT_TRUE(renderer->Convert(path, back));
        EXPECT_EQ(back, entity);
        auto const& item =
            dynamic_cast<KolbaVizCore::PolygonItem const&>(*scene.FindNode(path)->GetItem(0));
        EXPECT_FALSE(item.GetTriangles().empty());
        TopLoc_Location location;
        EXPECT_TRUE(
            BRep_Tool::Triangulation(TopoDS::Face(part.faces(static_cast<int>(face))), location)
                .IsNull())
            << "the shared shape stays as it was read";
    }
    float box[6];
    renderer->GetGeometryBox(box);
    EXPECT_EQ(std::vector<float>(box, box + 6), (std::vector<float>{-5, -5, 0, 5, 5, 10}));
}

TEST(OcctModeler, FailsForAReferenceWithoutAPartAndSoDoesAClone) {
    OcctModelerServices modeler(Shared(CTC1()));
    std::unique_ptr<VizBridgeTarvex::VizModelerServices> const clone(
        OcctModelerServices(Shared(CTC1())).Clone()); // outlives what it was made from
    EXPECT_EQ(clone->GetName(), u"Open CASCADE");
    TarvexPartDocument document =
        CTC1().Model().GetInputProductStructure().GetReferenceFromId(1).GetDocument();
    VizBridgeTarvex::VizModelerServices* const both[] = {clone.get(), &modeler};
    for (VizBridgeTarvex::VizModelerServices* const services : both) {
        for (int const id : {1, 2, 0, -1}) {
            SCOPED_TRACE(id);
            TarvexPartImportResult result;
            VizBridgeTarvex::VizPartContainer* made = nullptr; // the caller's if one comes back
            VizPort::WString error;
            bool const ok = services->ImportPart(id, document, result, made, nullptr, error);
            std::unique_ptr<VizBridgeTarvex::VizPartContainer> const owned(made);
            EXPECT_EQ(ok && owned, id == 1);
            EXPECT_EQ(VizPort::Narrow(error),
                      id == 1 ? ""
                              : "the STEP document has no part of reference " + std::to_string(id));
            EXPECT_EQ(result.GetPMIData().GetReferenceId(), id == 1 ? 1u : 0u);
            KolbaVizCore::SceneBuilder scene;
            std::unique_ptr<KolbaVizCore::ARenderer> const renderer(
                services->CreateRenderer(owned.get(), &scene, nullptr));
            EXPECT_EQ(renderer != nullptr, id == 1);
        }
    }
}

TEST(OcctModeler, ExplodeBoxMovesTheBoxThenPushesItAwayFromTheOriginByItsCentre) {
    auto const box = [](double x0, double y0, double z0, double x1, double y1, double z1) {
        double const low[3] = {x0, y0, z0}, high[3] = {x1, y1, z1};
        return VizBox(low, high);
    };
    double const quarterZ[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}}, moved[3] = {10, -20, 30};
    VizBridgeTarvex::VizTransf const turned(quarterZ, moved); // x to y, y to -x, then moved
    struct Case {
        VizBox box;
        double factors[3];
        VizBox expected;
    };
    OcctModelerServices modeler(Shared(CTC1()));
    for (Case const& c : {
             Case{box(1, 0, 0, 2, 1, 1), {0, 0, 0}, box(9, -19, 30, 10, -18, 31)},
             Case{box(1, 0, 0, 2, 1, 1), {1, 2, -1}, box(18.5, -56, -0.5, 19.5, -55, 0.5)},
             Case{VizBox(), {1, 2, 3}, VizBox()},
         })
        EXPECT_TRUE(modeler.ExplodeBox(turned, c.box, c.factors[0], c.factors[1], c.factors[2]) ==
                    c.expected);
}

TEST(OcctModeler, ImportsAnAssemblyThroughTheSpoolerAsInTheCallersProcess) {
    StepDocument const& step = StepTestFiles::Assembly();
    OcctModelerServices modeler(Shared(step));
    std::unique_ptr<Imported> caller, spooled;
    {
        TarvexScopedProcessors const one(1, std::nullopt);
        caller = Import(step, &modeler);
    }
    {
        TarvexScopedProcessors const spooler(0, 2);
        spooled = Import(step, &modeler);
    }
    EXPECT_EQ(spooled->processors, 2);
    std::map<std::uint32_t, Ids> expected, drawn;
    for (StepPart const& part : step.Parts())
        expected[part.referenceId] = OneTo(part.faces.Extent());
    FaceTags(*spooled->scene.GetScene(0), drawn);
    EXPECT_EQ(drawn, expected) << "each part drawn once, with every face";
    // The same scene but for the tag of the product node, which the scene library generates.
    auto const dump = [](KolbaVizCore::SceneBuilder const& scene) {
        std::string text = scene.Dump();
        std::string const tag = std::to_string(scene.GetScene(0)->GetChild(0)->GetTag());
        for (std::size_t at = text.find(tag); at != std::string::npos; at = text.find(tag, at))
            text.replace(at, tag.size(), "P");
        return text;
    };
    EXPECT_EQ(dump(spooled->scene), dump(caller->scene));
}

} // namespace
} // namespace VizBridgeStep
