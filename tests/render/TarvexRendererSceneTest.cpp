// The scenes that TarvexRenderer's walk draws, one whole dump per product.
#include "support/BrepTestModeler.h"
#include "support/RenderFixture.h"

#include <gtest/gtest.h>

#include <array>
#include <functional>
#include <sstream>
#include <string>

using namespace VizBridgeTarvex;

namespace {

using Peer = VizProductStructureTestPeer;
using Structure = std::unique_ptr<VizProductStructure>;
using RGB = std::array<unsigned short, 3>;

/// What the walk draws at `depth` for a container of one mesh from makeMesh, its polygon
/// tagged `tag` and its polyline `tag + 1`.
std::string meshPart(int depth, int mesh, int tag) {
    std::string const i(2 * static_cast<std::size_t>(depth), ' ');
    std::string const m = std::to_string(mesh);
    return i + "10007 level \"Part\"\n" + i + "  10006 type \"Geometry\"\n" + i + "    " + m +
           " body \"Mesh" + m + "\"\n" + i + "      10002 type \"MeshFaces\"\n" + i +
           "        1 entity \"MeshGeometry\" {polygon#" + std::to_string(tag) +
           " mode=1 n=3 c=192,192,192,255}\n" + i + "      10001 type \"MeshEdges\"\n" + i +
           "        2 entity \"MeshGeometry\" {polyline#" + std::to_string(tag + 1) +
           " pts=2 c=0,0,0,255}\n";
}

/// What a case prepares before the render.
struct Stage {
    explicit Stage(KolbaVizCore::SceneBuilder& scene) : builder(scene) {}
    KolbaVizCore::SceneBuilder& builder;
    TarvexModel model;
    Structure structure;        ///< built from `model` unless the case makes one
    bool modeler = false;       ///< render with a BrepTestModeler
    char const* only = nullptr; ///< compare only the dump's lines that hold this text
};

struct SceneCase {
    char const* name;
    std::function<void(Stage&)> stage;
    std::string dump;
    char const* box;
};

} // namespace

TEST(TarvexRendererScene, DrawsEachProductAsItsDump) {
    SceneCase const cases[] = {
        {"a part instanced twice: drawn once, then referenced",
         [](Stage& s) { s.structure = plate(); },
         "1 scene \"ROOT\"\n"
         "  {T} container(1) \"Plate\"\n"
         "    1000 level \"P.1\" T=[1 0 0 10; 0 1 0 0; 0 0 1 0]\n" +
             meshPart(3, 12, 0) +
             "    1001 level \"P.2\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0]\n"
             "      -> ref 1/{T}/1000/10007\n"
             "    1002 level \"Q.1\" T=[1 0 0 30; 0 1 0 0; 0 0 1 0]\n" +
             meshPart(3, 14, 2),
         "(10 0 0)-(31 1 0)"},
        {"unnamed instances, and a thousand children running into the next level's tags",
         [](Stage& s) {
             s.model.AddAssembly(1, u"");
             s.model.AddPart(2, u"");
             s.model.AddPart(3, u"Nut");
             s.model.AddRootInstance(1, u"");
             s.model.AddRootInstance(3, u"");
             for (int i = 0; i < 1001; ++i)
                 s.model.AddInstance(1, 2, i == 0 ? u"named" : u"");
         },
         [] {
             std::string text = "1 scene \"ROOT\"\n"
                                "  {T} container(1) \"{T}\"\n"
                                "    1000 level \"InstanceOfReference_1\"\n"
                                "      2000 level \"named\"\n";
             for (int i = 1; i <= 1000; ++i)
                 text += "      " + std::to_string(2000 + i) + " level \"InstanceOfReference_" +
                         std::to_string(i) + "\"\n";
             return text + "    1001 level \"InstanceOfReference_Nut\"\n";
         }(),
         "empty"},
        {"the outermost coloured instance colours every part below it",
         [](Stage& s) {
             KolbaVizCore::RenderingOptions options;
             options.SetDefaultFaceColor(KolbaVizCore::RGBAColor(9, 9, 9, 255));
             s.builder.SetRenderingOptions(options);
             s.model.AddAssembly(1, u"Outer");
             s.model.AddAssembly(2, u"Inner");
             s.model.AddPart(3, u"Part");
             s.model.AddRootInstance(1, u"Outer").rgb = RGB{255, 0, 0};
             s.model.AddInstance(1, 2, u"Inner").rgb = RGB{0, 255, 0};
             s.model.AddInstance(2, 3, u"Deep");
             s.model.AddInstance(1, 3, u"Shallow");
             s.model.AddRootInstance(3, u"Translucent").alpha = 128;
             s.model.AddRootInstance(3, u"Plain");
         },
         "1 scene \"ROOT\"\n"
         "  {T} container(1) \"{T}\"\n"
         "    1000 level \"Outer\"\n"
         "      2000 level \"Inner\"\n"
         "        3000 level \"Deep\" color=255,0,0,255 override\n"
         "      2001 level \"Shallow\" color=255,0,0,255 override\n"
         "    1001 level \"Translucent\" color=9,9,9,128 override\n"
         "    1002 level \"Plain\"\n",
         "empty"},
        {"hidden and suppressed instances stand hidden, outside the extents",
         [](Stage& s) {
             s.model.AddPart(1, u"Cube");
             s.model.AddAssembly(2, u"Holder");
             s.model.AddRootInstance(1, u"Shown");
             TarvexAuthoredInstance& hidden = s.model.AddRootInstance(1, u"Hidden");
             hidden.placement = at(100);
             hidden.hidden = true;
             TarvexAuthoredInstance& suppressed = s.model.AddRootInstance(1, u"Gone");
             suppressed.placement = at(-100);
             suppressed.suppressed = true;
             s.model.AddRootInstance(2, u"HiddenHolder").hidden = true;
             s.model.AddInstance(2, 1, u"Child").placement = at(0, 50);
             s.structure = buildStructure(s.model);
             Peer::addVizContainer(*s.structure, 1, makeMeshContainer(1, 5, 0));
         },
         "1 scene \"ROOT\"\n"
         "  {T} container(1) \"{T}\"\n"
         "    1000 level \"Shown\"\n" +
             meshPart(3, 5, 0) +
             "    1001 level \"Hidden\" T=[1 0 0 100; 0 1 0 0; 0 0 1 0] hidden\n"
             "      -> ref 1/{T}/1000/10007\n"
             "    1002 level \"Gone\" T=[1 0 0 -100; 0 1 0 0; 0 0 1 0] hidden\n"
             "      -> ref 1/{T}/1000/10007\n"
             "    1003 level \"HiddenHolder\" hidden\n"
             "      2000 level \"Child\" T=[1 0 0 0; 0 1 0 50; 0 0 1 0]\n"
             "        -> ref 1/{T}/1000/10007\n",
         "(0 0 0)-(1 51 0)"},
        {"part containers win over VizContainers, drawn by the modeler",
         [](Stage& s) {
             s.structure = plate();
             Peer::addPartContainer(*s.structure, 10, new TestPartContainer(u"P", 10));
             Peer::addPartContainer(*s.structure, 20, new TestPartContainer(u"Q", 20));
             s.modeler = true;
         },
         "1 scene \"ROOT\"\n"
         "  {T} container(1) \"Plate\"\n"
         "    1000 level \"P.1\" T=[1 0 0 10; 0 1 0 0; 0 0 1 0]\n"
         "      10011 level \"Brep\" {polygon#0 mode=1 n=3}\n"
         "    1001 level \"P.2\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0]\n"
         "      -> ref 1/{T}/1000/10011\n"
         "    1002 level \"Q.1\" T=[1 0 0 30; 0 1 0 0; 0 0 1 0]\n"
         "      10011 level \"Brep\" {polygon#0 mode=1 n=3}\n",
         "(10 0 0)-(31 1 1)"},
        {"elements of every kind under one Geometry node; scaled containers",
         [](Stage& s) {
             // The first part holds every kind of element, scaled by 2; the second a mesh
             // scaled by -1 at x = 10, the third one scaled by 1e-6 at x = 20.
             for (unsigned int id = 1; id <= 3; ++id) {
                 s.model.AddPart(id, u"P");
                 s.model.AddRootInstance(id, u"P").placement = at(10.0 * (id - 1));
             }
             s.structure = buildStructure(s.model);
             auto named = [](auto* element, int id) {
                 element->setID(static_cast<unsigned long>(id));
                 return element;
             };
             auto* mixed = new VizContainer(1);
             mixed->AddCGPointSet(named(new KolbaVizCore::VizPointSet, 6));
             mixed->AddCGWire(named(new KolbaVizCore::VizWire, 4));
             mixed->AddCGMesh(makeMesh(2, 0));
             mixed->AddPointSet(named(new KolbaVizCore::VizPointSet, 5));
             mixed->AddWire(named(new KolbaVizCore::VizWire, 3));
             mixed->AddMesh(makeMesh(1, 0));
             mixed->AddMesh(nullptr);
             mixed->SetScaleFactor(2.0);
             Peer::addVizContainer(*s.structure, 1, mixed);
             for (auto const& [id, scale] : {std::pair{2, -1.0}, std::pair{3, 1e-6}}) {
                 VizContainer* container = makeMeshContainer(id, 5 + id, 0);
                 container->SetScaleFactor(scale);
                 Peer::addVizContainer(*s.structure, id, container);
             }
             s.only = "body";
         },
         "          1 body \"Mesh1\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          2 body \"Mesh2\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          3 body \"Wire3\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          4 body \"Wire4\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          5 body \"PointSet5\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          6 body \"PointSet6\" T=[2 0 0 0; 0 2 0 0; 0 0 2 0]\n"
         "          7 body \"Mesh7\" T=[-1 0 0 0; 0 -1 0 0; 0 0 -1 0]\n"
         "          8 body \"Mesh8\"\n",
         "(0 -1 0)-(20 2 0)"},
        {"a refused instance leaves its tag unused, refused Part nodes leave instances empty",
         [](Stage& s) {
             s.structure = plate();
             s.builder.FailContextsNamed(u"P.1");
             s.builder.FailContextsTagged(10007);
         },
         "1 scene \"ROOT\"\n"
         "  {T} container(1) \"Plate\"\n"
         "    1001 level \"P.2\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0]\n"
         "    1002 level \"Q.1\" T=[1 0 0 30; 0 1 0 0; 0 0 1 0]\n",
         "empty"},
        {"a refused product node",
         [](Stage& s) {
             s.structure = plate();
             s.builder.FailContextsOfKind(KolbaVizCore::ContextKind::Container);
         },
         "1 scene \"ROOT\"\n", "empty"},
        {"a refused construction",
         [](Stage& s) {
             s.structure = plate();
             s.builder.FailContextsOfKind(KolbaVizCore::ContextKind::Construction);
         },
         "", "empty"},
    };
    for (SceneCase const& c : cases) {
        SCOPED_TRACE(c.name);
        RenderScene scene;
        Stage stage(scene.builder);
        c.stage(stage);
        if (!stage.structure)
            stage.structure = buildStructure(stage.model);
        BrepTestModeler modeler;
        TarvexRendererProbe renderer(stage.structure.get(), &scene.builder,
                                     stage.modeler ? &modeler : nullptr);
        EXPECT_TRUE(renderer.Render()) << "a refused level is no failure";
        EXPECT_EQ(scene.builder.GetOpenLevelCount(), 0);
        std::istringstream dump(dumpOf(scene.builder, renderer));
        std::string kept;
        for (std::string line; std::getline(dump, line);)
            kept += stage.only && line.find(stage.only) == std::string::npos ? "" : line + '\n';
        EXPECT_EQ(kept, c.dump);
        EXPECT_EQ(boxText(renderer), c.box);
    }
}
