// The PMI scene: what PmiRenderer draws for one container, and what it records.
#include "support/DebugCapture.h"
#include "support/RenderFixture.h"

#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/render/PmiRenderer.h>

#include <gtest/gtest.h>

#include <map>
#include <memory>
#include <regex>
#include <stdexcept>
#include <string>

using namespace VizBridgeTarvex;
using KolbaVizCore::VizPMI;
using KolbaVizCore::VizPMIContainer;
using KolbaVizCore::VizPMIType;

namespace {

constexpr std::uint32_t kInstanceTag = 77;

VizPMIType const kNoteGroup(VizPMIType::FirstNote, "Notes", KolbaVizCore::Note);
VizPMIType const kNote(VizPMIType::FirstNote, "Note", KolbaVizCore::Note);
VizPMIType const kDimensionGroup(VizPMIType::FirstDimension, "Dimensions", KolbaVizCore::Dimension);
VizPMIType const kLinear(static_cast<VizPMIType::ID>(12), "LinearDimension",
                         KolbaVizCore::Dimension);

/// A PMI object `id` with one edge (id + 1) from (x,0,0) to (x+2,0,0), unless `edges` is off.
VizPMI* makePMI(int id, VizPMIType const& group, VizPMIType const& type, float x,
                bool edges = true) {
    auto pmi = std::make_unique<VizPMI>(group, type);
    pmi->setID(static_cast<unsigned long>(id));
    pmi->SetMechanicalID(u"pmi" + VizPort::Widen(std::to_string(id)));
    if (edges) {
        KolbaVizCore::VizEdge* const edge = makeEdge({x, 0, 0, x + 2, 0, 0});
        edge->setID(static_cast<unsigned long>(id + 1));
        pmi->AddEdge(edge); // the object takes the edge over
    }
    return pmi.release();
}

template <typename Collection>
Collection* makeCollection(int id, char16_t const* name, bool plane) {
    auto collection = std::make_unique<Collection>();
    collection->setID(static_cast<unsigned long>(id));
    collection->SetName(name);
    if constexpr (std::is_same_v<Collection, KolbaVizCore::VizView>) {
        if (plane) {
            float const origin[3] = {0, 0, 5};
            float const x[3] = {4, 0, 0};
            float const y[3] = {0, 3, 0};
            collection->SetPlane(origin, x, y);
        }
    }
    return collection.release();
}

/// What a test container holds: by default a note (10) and a linear dimension (20) with an
/// edge each, an FTA wire (30), the view "Front" (40) with a plane and the capture "Saved"
/// (50).
struct Content {
    bool pmi = true;
    bool edges = true;
    bool fta = true;
    bool collections = true;
    bool viewPlane = true;
    bool hiddenView = false;
    bool hiddenNote = false;
    double scale = 1.0;
};

std::unique_ptr<VizPMIContainer> makeContainer(Content const& content) {
    auto container = std::make_unique<VizPMIContainer>(5);
    container->SetScaleFactor(content.scale);
    if (content.pmi) {
        VizPMI* const note = makePMI(10, kNoteGroup, kNote, 0, content.edges);
        note->SetHidden(content.hiddenNote);
        container->AddVizPMI(note);
        container->AddVizPMI(makePMI(20, kDimensionGroup, kLinear, 4, content.edges));
    }
    if (content.fta) {
        auto wire = std::make_unique<KolbaVizCore::VizWire>();
        wire->setID(30);
        wire->AddEdge(makeEdge({0, 0, 1, 0, 1, 1}));
        container->AddVizFTACGWire(wire.release());
    }
    if (content.collections) {
        auto* const view = makeCollection<KolbaVizCore::VizView>(40, u"Front", content.viewPlane);
        view->SetHidden(content.hiddenView);
        container->AddView(view);
        container->AddCapture(makeCollection<KolbaVizCore::VizCapture>(50, u"Saved", false));
    }
    return container;
}

/// Renders `container` below the node "Instance" (tag 77) of a fresh scene.
struct PmiScene {
    explicit PmiScene(VizPMIContainer* container)
        : renderer(container, nullptr, &scene.builder, nullptr, false) {}

    bool Render() {
        KolbaVizCore::ConstructionContext const construction(&scene.builder);
        KolbaVizCore::SceneContext const root(&scene.builder, KolbaVizCore::Node::RootNodeId,
                                              u"ROOT");
        KolbaVizCore::SceneLevelContext const instance(&scene.builder, kInstanceTag, u"Instance");
        return renderer.Render();
    }

    RenderScene scene;
    PmiRenderer renderer;
};

/// The dump of everything below the instance node. A wire's edges take their tag from the
/// scene library's process-wide counter; it reads {N}.
std::string below(std::string const& dump) {
    std::string const marker = "\"Instance\"\n";
    std::size_t const at = dump.find(marker);
    std::string const text = at == std::string::npos ? dump : dump.substr(at + marker.size());
    return std::regex_replace(text, std::regex("[0-9]+ entity \"WireEdge\""),
                              "{N} entity \"WireEdge\"");
}

struct SceneCase {
    char const* name;
    Content content;
    std::string dump;
    char const* box;
};

} // namespace

TEST(PmiRenderer, DrawsEachContainerAsItsDump) {
    std::string const note = "      10101 level \"Notes\"\n"
                             "        10 level \"Note\"\n"
                             "          10001 level \"PMI Edges\"\n"
                             "            11 entity \"PMI Edge\" {polyline#0 pts=2 c=0,0,0,255}\n";
    std::string const dimension =
        "      10103 level \"Dimensions\"\n"
        "        20 level \"LinearDimension\"\n"
        "          10001 level \"PMI Edges\"\n"
        "            21 entity \"PMI Edge\" {polyline#1 pts=2 c=0,0,0,255}\n";
    auto const ftaWire = [](int item) { // the wire's line is the scene's item number `item`
        return "      11000 type \"FTAGeometry\"\n"
               "        30 body \"Wire\"\n"
               "          {N} entity \"WireEdge\" {polyline#" +
               std::to_string(item) + " pts=2 c=0,0,0,255}\n";
    };
    std::string const fta = ftaWire(2);
    std::string const plane = "        41 level \"Plane Rectangle\" color=255,255,255,255 "
                              "line=dashed/-1 {polyline#41 pts=5}\n";
    std::string const captures = "    10012 type \"Captures\"\n"
                                 "      50 level \"Saved\"\n";
    std::string const views = "    10010 type \"Views\"\n"
                              "      40 level \"Front\"\n" +
                              plane + captures;
    SceneCase const cases[] = {
        {"everything",
         {},
         "    10005 type \"PMI\"\n" + note + dimension + fta + views,
         "(0 0 0)-(6 1 1)"},
        {"an empty container: the three top nodes and no box",
         {.pmi = false, .fta = false, .collections = false},
         "    10005 type \"PMI\"\n"
         "    10010 type \"Views\"\n"
         "    10012 type \"Captures\"\n",
         "empty"},
        {"no FTA: no FTAGeometry node",
         {.fta = false},
         "    10005 type \"PMI\"\n" + note + dimension + views,
         "(0 0 0)-(6 0 0)"},
        {"PMI without edges: no PMI Edges node",
         {.edges = false},
         "    10005 type \"PMI\"\n"
         "      10101 level \"Notes\"\n"
         "        10 level \"Note\"\n"
         "      10103 level \"Dimensions\"\n"
         "        20 level \"LinearDimension\"\n" +
             ftaWire(0) + views,
         "(0 0 1)-(0 1 1)"},
        {"a hidden view is drawn, invisible",
         {.hiddenView = true},
         "    10005 type \"PMI\"\n" + note + dimension + fta +
             "    10010 type \"Views\"\n"
             "      40 level \"Front\" hidden\n" +
             plane + captures,
         "(0 0 0)-(6 1 1)"},
        {"a view without a plane has no outline",
         {.viewPlane = false},
         "    10005 type \"PMI\"\n" + note + dimension + fta +
             "    10010 type \"Views\"\n"
             "      40 level \"Front\"\n" +
             captures,
         "(0 0 0)-(6 1 1)"},
        {"a hidden PMI object is drawn, invisible",
         {.hiddenNote = true},
         "    10005 type \"PMI\"\n"
         "      10101 level \"Notes\"\n"
         "        10 level \"Note\" hidden\n"
         "          10001 level \"PMI Edges\"\n"
         "            11 entity \"PMI Edge\" {polyline#0 pts=2 c=0,0,0,255}\n" +
             dimension + fta + views,
         "(0 0 0)-(6 1 1)"},
        {"scale 2: on the objects and FTA bodies, not the views; the box doubled once",
         {.scale = 2.0},
         "    10005 type \"PMI\"\n"
         "      10101 level \"Notes\"\n"
         "        10 level \"Note\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          10001 level \"PMI Edges\"\n"
         "            11 entity \"PMI Edge\" {polyline#0 pts=2 c=0,0,0,255}\n"
         "      10103 level \"Dimensions\"\n"
         "        20 level \"LinearDimension\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          10001 level \"PMI Edges\"\n"
         "            21 entity \"PMI Edge\" {polyline#1 pts=2 c=0,0,0,255}\n"
         "      11000 type \"FTAGeometry\"\n"
         "        30 body \"Wire\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          {N} entity \"WireEdge\" {polyline#2 pts=2 c=0,0,0,255}\n" +
             views,
         "(0 0 0)-(12 2 2)"},
    };
    for (SceneCase const& c : cases) {
        SCOPED_TRACE(c.name);
        std::unique_ptr<VizPMIContainer> const container = makeContainer(c.content);
        PmiScene pmi(container.get());
        ASSERT_TRUE(pmi.Render());
        EXPECT_EQ(below(pmi.scene.builder.Dump()), c.dump);
        EXPECT_EQ(boxText(pmi.renderer), c.box);
    }
}

namespace {

std::string pathText(RenderId const& path) {
    std::string text;
    for (int i = 0; i < path.Length(); ++i)
        text += (i == 0 ? "" : "/") + std::to_string(path[i]);
    return text;
}

/// "id,parent,type -> element id" per key, in the map's order.
std::string recordsText(std::map<EntityId, VizElement const*> const& records) {
    std::string text;
    for (auto const& [key, element] : records)
        text += std::to_string(key.GetId()) + "," + std::to_string(key.GetParentId()) + "," +
                std::to_string(key.GetType()) + "->" + std::to_string(element->GetID()) + " ";
    return text;
}

} // namespace

TEST(PmiRenderer, RecordsWhatItDrewAndConvertsBothWays) {
    std::unique_ptr<VizPMIContainer> const container = makeContainer({});
    PmiScene pmi(container.get());
    ASSERT_TRUE(pmi.Render());
    PmiRenderer& renderer = pmi.renderer;
    EXPECT_EQ(pathText(renderer.GetRenderId()), "1/77/10005");
    EXPECT_EQ(renderer.OwnerReferences(), std::vector<std::uint32_t>{kInstanceTag});
    // Objects under their own entity ids, each group's last object under its summary key,
    // the FTA wire under FTAGeometry.
    EXPECT_EQ(recordsText(renderer.PMIElements()),
              "10,10101,10101->10 20,10103,10103->20 30,11000,11000->30 "
              "10101,10101,10101->10 10103,10103,10103->20 ");
    EXPECT_EQ(recordsText(renderer.ViewElements()), "40,10010,10010->40 10010,10010,10010->40 ");
    EXPECT_EQ(recordsText(renderer.CaptureElements()), "50,10012,10012->50 10012,10012,10012->50 ");
    EntityId given;
    ASSERT_TRUE(container->GetViews().front()->GetEntityMap().size() == 5u &&
                container->GetVizPMIs().front()->GetEntityID(given));
    EXPECT_EQ(given, EntityId(KolbaVizCore::Note, KolbaVizCore::Note, 10));

    struct ToPath {
        EntityId entity;
        char const* path; ///< null: no conversion
    };
    ToPath const toPaths[] = {
        {EntityId(KolbaVizCore::Note, KolbaVizCore::Note, 10), "1/77/10005/10101/10"},
        {EntityId(KolbaVizCore::Note, KolbaVizCore::Note, KolbaVizCore::Note), "1/77/10005/10101"},
        {EntityId(KolbaVizCore::Views, KolbaVizCore::Views, KolbaVizCore::Views), "1/77/10010"},
        {EntityId(KolbaVizCore::Captures, KolbaVizCore::Captures, 50), "1/77/10012/50"},
        {EntityId(KolbaVizCore::FTAGeometry, KolbaVizCore::FTAGeometry, 30), nullptr},
        {EntityId(KolbaVizCore::Note, KolbaVizCore::Note, 99), nullptr},
    };
    for (ToPath const& c : toPaths) {
        RenderId path = pathOf({5});
        EXPECT_EQ(renderer.Convert(c.entity, path), c.path != nullptr) << c.entity.GetId();
        EXPECT_EQ(pathText(path), c.path ? c.path : "");
    }

    struct ToEntity {
        RenderId path;
        char const* entity; ///< "id,parent,type"; null: not this renderer's
    };
    ToEntity const toEntities[] = {
        {pathOf({77, 10005}), "10005,10005,10007"},
        {pathOf({77, 10005, 10101}), "10101,10101,10101"},
        {pathOf({77, 10005, 10101, 10, 10001, 11}), "10,10101,10101"},
        {pathOf({77, 10005, 11000, 30}), "30,11000,11000"},
        {pathOf({77, 10010}), "10010,10010,10010"},
        {pathOf({77, 10012, 50, 51}), "50,10012,10012"},
        {pathOf({99, 10005, 10101, 10}), nullptr},
        {pathOf({77}), nullptr},
    };
    for (ToEntity const& c : toEntities) {
        EntityId entity(1, 2, 3);
        EXPECT_EQ(renderer.Convert(c.path, entity), c.entity != nullptr) << pathText(c.path);
        std::string const text = std::to_string(entity.GetId()) + "," +
                                 std::to_string(entity.GetParentId()) + "," +
                                 std::to_string(entity.GetType());
        EXPECT_EQ(text, c.entity ? c.entity : "3,1,2") << pathText(c.path);
    }

    // A second render draws the views and captures anew and keeps one owner tag.
    ASSERT_TRUE(pmi.Render());
    EXPECT_EQ(renderer.OwnerReferences(), std::vector<std::uint32_t>{kInstanceTag});
    std::string const dump = pmi.scene.builder.Dump();
    EXPECT_EQ(dump.find("\"Views\""), dump.rfind("\"Views\""));
}

TEST(PmiRenderer, APartInstancedTwiceDrawsItsPMIOnceAndTheSecondInstanceReferencesIt) {
    std::unique_ptr<VizProductStructure> const structure = plate();
    VizProductStructureTestPeer::addPMIContainer(*structure, 10, makeContainer({}).release());
    RenderScene scene;
    TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
    ASSERT_TRUE(renderer.Render());
    std::string const dump = dumpOf(scene.builder, renderer);
    EXPECT_EQ(dump.find("10005 type \"PMI\""), dump.rfind("10005 type \"PMI\"")) << "drawn once";
    EXPECT_NE(dump.find("    1001 level \"P.2\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0]\n"
                        "      -> ref 1/{T}/1000/10007\n"
                        "      -> ref 1/{T}/1000/10005\n"),
              std::string::npos)
        << dump;
    ASSERT_EQ(renderer.pmiRenderers().size(), 1u);
    PmiRenderer const& pmi = *renderer.pmiRenderers().at(10);
    EXPECT_EQ(pmi.OwnerReferences(), (std::vector<std::uint32_t>{1000, 1001}));
    EXPECT_EQ(renderer.brepRenderers().count(10), 1u) << "a null owner entry";
    // Both instances' boxes come from the one record, each moved by its own placement:
    // the PMI spans x 0..6 and the instances stand at x 10 and 20.
    float box[6];
    renderer.GetGeometryBox(box);
    EXPECT_EQ(boxText(box), "(10 0 0)-(31 1 1)");
}

TEST(PmiRenderer, APickFindsTheElementAndTheInstanceUnderTheRayThroughEitherInstance) {
    std::unique_ptr<VizProductStructure> const structure = plate();
    VizProductStructureTestPeer::addPMIContainer(*structure, 10, makeContainer({}).release());
    RenderScene scene;
    ASSERT_TRUE(scene.builder.SetPickTolerance(0.1));
    TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
    ASSERT_TRUE(renderer.Render());

    struct PickCase {
        char const* name;
        double x, y;          ///< a ray straight down from z 10
        char const* element;  ///< its type and id; "" for none
        char const* instance; ///< "" for none
    };
    // P.1 stands at x 10, P.2 at x 20, Q.1 at x 30. A P holds a triangle over (0,0) (1,0)
    // (0,1), the note's line from (0,0) to (2,0), the dimension's from (4,0) to (6,0), all at
    // z 0, and the FTA wire from (0,0) to (0,1) at z 1.
    PickCase const cases[] = {
        {"the FTA wire above the triangle", 20, 0.5, "VizWire 30", "P.2"},
        {"the note's line beside the triangle", 21.5, 0, "VizPMI 10", "P.2"},
        {"the dimension of the first instance", 15, 0, "VizPMI 20", "P.1"},
        {"the triangle alone", 20.3, 0.3, "VizMesh 12", "P.2"},
        {"nothing", 50, 50, "", ""},
    };
    for (PickCase const& c : cases) {
        SCOPED_TRACE(c.name);
        KolbaVizCore::Ray ray;
        ray.origin[0] = c.x;
        ray.origin[1] = c.y;
        ray.origin[2] = 10;
        ray.direction[2] = -1;
        VizElement* element = nullptr;
        VizPSEntry* entry = nullptr;
        EXPECT_EQ(structure->PickVisual(&scene.adapter, ray, element, entry),
                  *c.element != '\0' || *c.instance != '\0');
        EXPECT_EQ(element ? element->GetElementType() + " " + std::to_string(element->GetID())
                          : std::string(),
                  c.element);
        EXPECT_EQ(entry ? VizPort::Narrow(entry->GetInstanceName()) : std::string(), c.instance);
    }

    // Without a view nothing is asked and nothing is touched.
    VizElement* const element = structure->GetVizPMIContainer(10)->GetVizPMIs().front();
    VizPSEntry* const entry = structure->GetChildren().front();
    VizElement* elementOut = element;
    VizPSEntry* entryOut = entry;
    EXPECT_FALSE(structure->PickVisual(nullptr, KolbaVizCore::Ray(), elementOut, entryOut));
    EXPECT_EQ(elementOut, element);
    EXPECT_EQ(entryOut, entry);
}

namespace {

/// Breaks the walk when it reaches its second part, after the first part's PMI was drawn.
void throwAtSecondPart(int const& done, int const&, char const* phase) {
    if (std::string(phase) == "RenderPart" && done == 2)
        throw std::runtime_error("walk broke");
}

} // namespace

TEST(PmiRenderer, ARenderThatFailsHalfwayKeepsItsPMIRenderersForTheNextRenderOrTheEnd) {
    std::unique_ptr<VizProductStructure> const structure = plate();
    VizProductStructureTestPeer::addPMIContainer(*structure, 10, makeContainer({}).release());
    RenderScene scene;
    {
        TarvexRendererProbe renderer(structure.get(), &scene.builder, nullptr);
        renderer.SetProgressCallback(&throwAtSecondPart);
        EXPECT_FALSE(renderer.Render());
        ASSERT_EQ(renderer.pmiRenderers().size(), 1u) << "made before the walk broke";
        renderer.SetProgressCallback(nullptr);
        ASSERT_TRUE(renderer.Render()); // the broken drawing gives way to a whole one
        EXPECT_EQ(renderer.pmiRenderers().size(), 1u);
        std::string const dump = scene.builder.Dump();
        EXPECT_EQ(dump.find("10005 type \"PMI\""), dump.rfind("10005 type \"PMI\""));
    } // the renderer frees each PMI renderer once, which the sanitized run checks
    EXPECT_EQ(scene.builder.GetNodeCount(), 1u) << "only the scene's ROOT stays";
}

TEST(PmiRenderer, WithoutAContainerOrABuilderItDrawsNothingAndStillAnswers) {
    RenderScene scene;
    PmiRenderer noContainer(nullptr, nullptr, &scene.builder, nullptr, false);
    EXPECT_TRUE(noContainer.Render());
    EXPECT_TRUE(noContainer.GetRenderId().IsEmpty());
    EXPECT_EQ(scene.builder.GetNodeCount(), 0u);

    std::unique_ptr<VizPMIContainer> const container = makeContainer({});
    PmiRenderer noBuilder(container.get(), nullptr, nullptr, nullptr, false);
    EXPECT_TRUE(noBuilder.Render());
    EXPECT_TRUE(noBuilder.ViewsRenderId().IsEmpty() && noBuilder.PMIElements().empty());
    EntityId entity;
    RenderId path;
    EXPECT_FALSE(noBuilder.Convert(RenderId(), entity));
    EXPECT_FALSE(noBuilder.Convert(entity, path));
    noBuilder.ClearAll();
}

TEST(PmiRenderer, HighlightsAndToolTipsOfItsOwnPaths) {
    std::unique_ptr<VizPMIContainer> const container = makeContainer({});
    VizPMI& note = *container->GetVizPMIs()[0];
    VizPMI& dimension = *container->GetVizPMIs()[1];
    note.SetLinkedEntityMechIDs({u"pmi20", u"face7"}); // a PMI object and a model face
    dimension.SetName(u"Length 60");
    for (char16_t const* id : {u"pmi10", u"pmi20"}) {
        auto record = std::make_unique<KolbaVizCore::SemanticPMI>();
        record->ID = id;
        container->AddSemanticPMI(record.release()); // the container owns it
    }
    container->GetViews()[0]->AddMember(u"pmi20");
    PmiScene pmi(container.get());
    ASSERT_TRUE(pmi.Render());
    DebugCapture const debug;

    constexpr std::uint32_t R = KolbaVizCore::Node::RootNodeId, P = KolbaVizCore::PMI,
                            I = kInstanceTag;
    std::string const semantic = "Name : \nLabel : \nID : pmi20\n";
    struct Case {
        RenderId picked;
        std::vector<RenderId> highlight; ///< empty: not this renderer's
        std::string tip;
    };
    Case const cases[] = {
        // An edge of the note: the note, then the dimension it points at.
        {pathOf({R, I, P, 10101, 10, 10001, 11}),
         {pathOf({R, I, P, 10101, 10}), pathOf({R, I, P, 10103, 20})},
         "Name : \nLabel : \nID : pmi10\n"},
        {pathOf({R, I, P, 10103, 20}),
         {pathOf({R, I, P, 10103, 20})},
         "PMI : Length 60\nRefID : 5\n\n" + semantic},
        {pathOf({R, I, P, 10103}),
         {pathOf({R, I, P, 10103})},
         "PMI : Length 60\nRefID : 5\n\n" + semantic},
        {pathOf({R, I, P, 11000, 30}), {pathOf({R, I, P, 11000, 30})}, ""}, // no links: itself
        {pathOf({R, I, KolbaVizCore::Views, 40}),
         {pathOf({R, I, KolbaVizCore::Views, 40}), pathOf({R, I, P, 10103, 20})},
         "View : Front\nRefID : 5\n\n"},
        // The node of all views stands for the last one.
        {pathOf({R, I, KolbaVizCore::Views}),
         {pathOf({R, I, KolbaVizCore::Views}), pathOf({R, I, P, 10103, 20})},
         "Views"},
        {pathOf({R, I, KolbaVizCore::Captures, 50}),
         {pathOf({R, I, KolbaVizCore::Captures, 50})},
         "Capture : Saved\nRefID : 5\n\n"},
        {pathOf({R, I + 1, P, 10103, 20}), {}, ""}, // another node's PMI
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(&c - cases);
        RenderId* raw = nullptr;
        int count = 0;
        bool const highlighted = pmi.renderer.ConvertToHighlight(c.picked, raw, count);
        std::unique_ptr<RenderId[]> const ids(raw); // the caller's, released as an array
        EXPECT_EQ(std::vector<RenderId>(ids.get(), ids.get() + (highlighted ? count : 0)),
                  c.highlight);
        EXPECT_EQ(VizPort::Narrow(pmi.renderer.GetToolTip(c.picked)), c.tip);
    }
    EXPECT_EQ(debug.texts(), std::vector<VizPort::WString>{u"pmi20"})
        << "each linked PMI id, once for the one highlight that follows links";
}
