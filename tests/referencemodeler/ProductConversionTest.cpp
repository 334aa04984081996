// What a viewer asks the product renderer after a render, on parts that the reference modeler
// drew: entity ids for picked paths and back, highlight paths and tool tips.
#include "support/ReferenceModelerFixture.h"
#include "support/RenderFixture.h"
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/render/TarvexRenderer.h>
#include <VizBridge/render/UniqueRenderer.h>

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

using namespace VizReferenceModeler;
using KolbaVizCore::Node;
using VizBridgeTarvex::TarvexRenderer;
using VizBridgeTarvex::VizProductStructure;

namespace {

constexpr std::uint32_t R = Node::RootNodeId;
constexpr std::uint32_t Dimension = KolbaVizCore::Dimension;
constexpr std::uint32_t Link = KolbaVizCore::Link;
constexpr std::uint32_t PartRecord = TarvexRenderer::PartRecordType;
constexpr std::uint32_t DimensionId = 7;
constexpr std::uint32_t NutId = 6;

RenderId path(std::vector<std::uint32_t> const& tags, std::uint32_t leading = 1) {
    RenderId id(leading);
    for (std::uint32_t const tag : tags)
        id.AddValue(tag);
    return id;
}

/// The tags of `id` with the scene top as R and the product's tag as T: "R T 1000 10011".
std::string text(RenderId const& id, std::uint32_t product) {
    std::string out;
    for (std::uint32_t const tag : id.GetTags())
        out += out.empty() ? (tag == R ? "R" : std::to_string(tag))
                           : " " + (tag == product ? "T" : std::to_string(tag));
    return out;
}

/// Pin.1 (1000), Bolt.1 (1001) and Pin.2 (1002) at the top, Nut.1 (2000) inside Holder.1
/// (1003); the Pin carries a dimension linked to its faces 101 and 102.
struct Frame {
    Frame() {
        TarvexModel model = MakeModel();
        model.AddAssembly(5, u"Holder");
        model.AddPart(NutId, u"Nut")
            .geometry.faces.push_back({301, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 2}});
        model.AddRootInstance(PinId, u"Pin.2");
        model.AddRootInstance(5, u"Holder.1");
        model.AddInstance(5, NutId, u"Nut.1");
        structure = VizBridgeTarvex::buildStructure(model);
        TarvexInputProductStructure const input = model.GetInputProductStructure();
        VizBridgeTarvex::VizBuilder importer(*structure, input, nullptr);
        importer.SetModelerServices(&services);
        importer.ImportAndBuildPS();

        auto pmi = std::make_unique<KolbaVizCore::VizPMIContainer>(static_cast<int>(PinId));
        KolbaVizCore::VizPMIType const group(KolbaVizCore::VizPMIType::FirstDimension, "Dimensions",
                                             KolbaVizCore::Dimension);
        auto dimension = std::make_unique<KolbaVizCore::VizPMI>(group, group);
        dimension->setID(DimensionId);
        dimension->SetMechanicalID(u"dim");
        pmi->AddVizPMI(dimension.release()); // the container owns it
        auto record = std::make_unique<KolbaVizCore::SemanticPMI>();
        record->ID = u"dim";
        record->Properties[u"Type"] = u"Length";
        record->BREPLinks = {EntityId(PinId, KolbaVizCore::Face, 101),
                             EntityId(PinId, KolbaVizCore::Face, 102),
                             EntityId(PinId, KolbaVizCore::Face, 999)}; // not drawn: left out
        pmi->AddSemanticPMI(record.release());
        VizBridgeTarvex::VizProductStructureTestPeer::addPMIContainer(*structure, PinId,
                                                                      pmi.release());
        builder.SetGeometryItemFactory(
            std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
        renderer = VizBridgeTarvex::MakeUniqueRenderer(structure.get(), &services, &builder);
        rendered = renderer->Render();
        tag = renderer->GetProductRenderId()[1];
    }

    ReferenceModelerServices services;
    std::unique_ptr<VizProductStructure> structure;
    KolbaVizCore::SceneBuilder builder;
    std::unique_ptr<TarvexRenderer> renderer;
    bool rendered = false;
    std::uint32_t tag = 0;
};

/// Every path the scene shows a node under, through node references too.
void eachPath(Node const& node, RenderId const& at, std::function<void(RenderId const&)> const& f) {
    f(at);
    auto const below = [&](Node const& child) {
        RenderId next = at;
        next.AddValue(child.GetTag());
        eachPath(child, next, f);
    };
    for (std::size_t i = 0; i < node.GetChildCount(); ++i)
        below(*node.GetChild(i));
    for (std::size_t i = 0; i < node.GetReferenceCount(); ++i)
        below(*node.GetReference(i));
}

bool isAncestorOrSelf(Node const* ancestor, Node const* node) {
    for (; node != nullptr; node = node->GetParent())
        if (node == ancestor)
            return true;
    return false;
}

/// For every path of the scene: the entity a pick gives converts to the path of the picked
/// node or of a node above it (on the path, or above the drawing it shows), and that path converts
/// back to the same entity (tessellated bodies excepted: their path names the "Geometry" node);
/// once more changes nothing. Returns the number of paths that converted both ways.
int checkRoundTrips(TarvexRenderer& renderer, KolbaVizCore::SceneBuilder const& builder) {
    int checked = 0;
    eachPath(*builder.GetScene(0), path({R}), [&](RenderId const& picked) {
        EntityId entity, back;
        RenderId found;
        if (!renderer.Convert(picked, entity) || !renderer.Convert(entity, found))
            return;
        SCOPED_TRACE(text(picked, 0) + " -> " + text(found, 0));
        ASSERT_TRUE(picked.BeginsWith(found) ||
                    isAncestorOrSelf(builder.FindNode(found), builder.FindNode(picked)));
        ASSERT_TRUE(renderer.Convert(found, back));
        if (entity.GetType() != KolbaVizCore::Vis) {
            ASSERT_EQ(back, entity);
        }
        RenderId again;
        ASSERT_TRUE(renderer.Convert(back, again) && again == found);
        ++checked;
    });
    return checked;
}

} // namespace

TEST(ProductConversion, AnswersForInstancesBrepEntitiesAndPMIBothWays) {
    Frame f;
    ASSERT_TRUE(f.rendered);
    std::uint32_t const T = f.tag;
    struct Case {
        std::vector<std::uint32_t> picked;
        std::optional<EntityId> entity;
        char const* back; ///< the path the entity converts to; null: no conversion
    };
    std::uint32_t const B = KolbaVizCore::Body, F = KolbaVizCore::Face;
    Case const cases[] = {
        {{R, T}, EntityId(R, Link, T), "R T"},
        {{R, T, 1000}, EntityId(1000, PartRecord, 1000), "R T 1000"}, // before its Link key
        {{R, T, 1003, 2000}, EntityId(1003, Link, 2000), "R T 1003 2000"},
        {{R, T, 1000, 10011}, EntityId(1000, PartRecord, 1000), "R T 1000"},
        {{R, T, 1000, 10011, 1, B, PinId}, EntityId(PinId, B, PinId), "R T 1000 10011 1 10003 3"},
        {{R, T, 1002, 10011, 1, B, PinId, F, 102}, EntityId(PinId, F, 102), nullptr}, // Pin.2
        {{R, T, 1003, 2000, 10011, 1, B, NutId, F, 301}, EntityId(NutId, F, 301), nullptr},
        {{R, T, 1003, 2000, 10011, 1, B, NutId},
         EntityId(NutId, B, NutId),
         "R T 1003 2000 10011 1 10003 6"},
        {{R, T, 1002, KolbaVizCore::PMI, Dimension, DimensionId},
         EntityId(Dimension, Dimension, DimensionId),
         "R T 1000 10005 10103 7"},
        {{2, T, 1000}, std::nullopt, nullptr},
    };
    for (Case const& c : cases) {
        std::vector<std::uint32_t> const& picked = c.picked;
        SCOPED_TRACE(text(path(picked), T));
        EntityId entity;
        EXPECT_EQ(f.renderer->Convert(path(picked), entity), c.entity.has_value());
        EXPECT_EQ(entity, c.entity.value_or(EntityId()));
        RenderId back;
        EXPECT_EQ(f.renderer->Convert(entity, back), c.back != nullptr);
        EXPECT_EQ(text(back, T), c.back ? c.back : "");
        EXPECT_TRUE(!c.back || (back.GetLeading() == 1 && f.builder.FindNode(back)));
    }
    RenderId product;
    EXPECT_TRUE(f.renderer->Convert(EntityId(1, KolbaVizCore::Group, 12345), product) &&
                text(product, T) == "R T");
    EXPECT_FALSE(f.renderer->Convert(EntityId(KolbaVizCore::Vis, KolbaVizCore::Vis, 77), product))
        << "several roots: no synthetic geometry path";
    EXPECT_GT(checkRoundTrips(*f.renderer, f.builder), 20);
}

TEST(ProductConversion, HighlightsAndToolTips) {
    Frame f;
    ASSERT_TRUE(f.rendered);
    std::uint32_t const T = f.tag;
    struct Case {
        std::vector<std::uint32_t> picked;
        std::vector<char const*> highlight;
        std::string tip;
    };
    Case const cases[] = {
        // The dimension picked under Pin.2: itself, then the drawn faces it controls there.
        {{R, T, 1002, KolbaVizCore::PMI, Dimension, DimensionId, KolbaVizCore::Edge},
         {"R T 1002 10005 10103 7", "R T 1002 10011 1 10003 3 10002 101",
          "R T 1002 10011 1 10003 3 10002 102"},
         "Name : \nLabel : \nID : dim\nType : Length\n"},
        {{R, T, 1002, 10011, 1, KolbaVizCore::Body, PinId, KolbaVizCore::Face, 102},
         {"R T 1002"},
         "Face with ID: 102\nParent Body ID: 3"},
        {{R, T, 1003, 2000}, {"R T 1003 2000"}, ""},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(text(path(c.picked), T));
        RenderId* raw = nullptr;
        int count = 0;
        ASSERT_TRUE(f.renderer->ConvertToHighlight(path(c.picked), raw, count));
        std::unique_ptr<RenderId[]> const ids(raw); // the caller's, released as an array
        std::vector<std::string> got, expected(c.highlight.begin(), c.highlight.end());
        for (int i = 0; i < count; ++i)
            got.push_back(text(ids[i], T) + (f.builder.FindNode(ids[i]) ? "" : " (no node)"));
        EXPECT_EQ(got, expected);
        EXPECT_EQ(VizPort::Narrow(f.renderer->GetToolTip(path(c.picked))), c.tip);
    }
}

TEST(ProductConversion, AfterClearingOnlyWhatNeedsNoRecordAnswers) {
    Frame f;
    ASSERT_TRUE(f.rendered);
    f.renderer->ClearAll();
    EntityId entity;
    RenderId found;
    EXPECT_FALSE(f.renderer->Convert(path({R, f.tag, 1000}), entity) ||
                 f.renderer->Convert(EntityId(1000, PartRecord, 1000), found));
    EXPECT_TRUE(f.renderer->Convert(EntityId(1, KolbaVizCore::Group, 0), found));
    RenderId* raw = nullptr;
    int count = 0;
    EXPECT_TRUE(f.renderer->ConvertToHighlight(path({R, f.tag, 1000}), raw, count) && count == 1);
    delete[] raw;
}

TEST(ProductConversion, RoundTripsOverEveryNodeOfTenThousandInstances) {
    // 100 instances of an assembly of 100 parts over 10 tessellated references.
    TarvexModel model;
    model.AddAssembly(1, u"Row");
    for (unsigned int part = 0; part < 10; ++part)
        model.AddPart(10 + part, u"P");
    for (unsigned int i = 0; i < 100; ++i) {
        model.AddRootInstance(1, u"Row");
        model.AddInstance(1, 10 + i % 10, u"P");
    }
    std::unique_ptr<VizProductStructure> structure = VizBridgeTarvex::buildStructure(model);
    for (int part = 0; part < 10; ++part)
        VizBridgeTarvex::VizProductStructureTestPeer::addVizContainer(
            *structure, 10 + part, VizBridgeTarvex::makeMeshContainer(10 + part, part, 0));
    KolbaVizCore::SceneBuilder builder;
    auto const renderer = VizBridgeTarvex::MakeUniqueRenderer(structure.get(), nullptr, &builder);
    ASSERT_TRUE(renderer->Render());
    EXPECT_GE(checkRoundTrips(*renderer, builder), 10100);
}

TEST(ProductConversion, ASingleRootPartNamesItsTessellatedBodies) {
    TarvexModel model;
    model.AddPart(10, u"P");
    model.AddRootInstance(10, u"P.1");
    std::unique_ptr<VizProductStructure> structure = VizBridgeTarvex::buildStructure(model);
    VizBridgeTarvex::VizProductStructureTestPeer::addVizContainer(
        *structure, 10, VizBridgeTarvex::makeMeshContainer(10, 12, 0));
    KolbaVizCore::SceneBuilder builder;
    auto const renderer = VizBridgeTarvex::MakeUniqueRenderer(structure.get(), nullptr, &builder);
    ASSERT_TRUE(renderer->Render());
    std::uint32_t const T = renderer->GetProductRenderId()[1], V = KolbaVizCore::Vis;
    struct Case {
        std::vector<std::uint32_t> picked;
        EntityId entity;
        char const* highlight;
    };
    Case const cases[] = {
        {{R, T, 1000, 10007, V, 12}, EntityId(V, V, 12), "R T 1000 10007 10006 12"},
        // below a body: the last two tags
        {{R, T, 1000, 10007, V, 12, 10002, 1}, EntityId(10002, V, 1), "R T 1000 10007 10006 12"},
        {{R, T, 1000, 10007, V}, EntityId(V, V, V), "R T 1000 10007 10006 10006"},
        {{R, T, 1000, 10007, 5, 6, 7, 8, 9},
         EntityId(1000, PartRecord, 1000),
         "R T 1000 10007 5 6 7"},
        {{R, T, 1000, 10007, V, 12, 10002, 1, 9},
         EntityId(1, V, 9),
         "R T 1000 10007 10006 12 10002"},
        {{R, T, 1000}, EntityId(1000, PartRecord, 1000), "R T 1000"},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(text(path(c.picked), T));
        EntityId entity;
        EXPECT_TRUE(renderer->Convert(path(c.picked), entity) && entity == c.entity);
        RenderId* raw = nullptr;
        int count = 0;
        ASSERT_TRUE(renderer->ConvertToHighlight(path(c.picked), raw, count) && count == 1);
        std::unique_ptr<RenderId[]> const ids(raw);
        EXPECT_EQ(text(ids[0], T), c.highlight);
    }
    RenderId found;
    EXPECT_TRUE(renderer->Convert(EntityId(V, KolbaVizCore::Body, 12), found) &&
                text(found, T) == "R T 1000 10007 10006 12");
    EXPECT_TRUE(renderer->Convert(EntityId(V, V, 999), found) &&
                text(found, T) == "R T 1000 10007 10006")
        << "an unknown body still names the one part's geometry";
}
