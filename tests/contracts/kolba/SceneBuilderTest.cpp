#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/View3DAdapter.h>

#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/BodyContext.h>
#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/ContainerContext.h>
#include <VizBridge/contracts/kolba/EntityContext.h>
#include <VizBridge/contracts/kolba/EntityTypeContext.h>
#include <VizBridge/contracts/kolba/GeometryItem.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>

#include <gtest/gtest.h>

#include <limits>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

using namespace KolbaVizCore;

namespace {

constexpr std::uint32_t R = Node::RootNodeId;
using Tags = std::vector<std::uint32_t>;

RenderId pathOf(Tags const& tags) {
    RenderId id(1);
    for (std::uint32_t const tag : tags)
        id.AddValue(tag);
    return id;
}

void placeAt(SceneBuilder& builder, double x) {
    double const matrix[16] = {1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, x, 0, 0, 1}; // column-major
    builder.SetCurrentTransform(matrix);
}

/// The triangle (0,0,z) (1,0,z) (0,1,z), from arrays that are gone once it is added.
void addTriangle(SceneBuilder& builder, unsigned long tag, float z) {
    float const vertices[9] = {0, 0, z, 1, 0, z, 0, 1, z};
    int const indices[3] = {0, 1, 2};
    builder.AddGeometryItem(
        builder.GetGeometryItemFactory()->MakePolygon(tag, vertices, nullptr, indices, 9, 0, 3, 1));
}

/// Product 77 with P.1 at x = 10 drawing Part/Geometry/Mesh12 as one triangle, and P.2 at
/// x = 20 showing P.1's Part through a reference, as a second instance of a part does. Beside
/// it a styled cover at x = 20: a nearer triangle over P.2, a line and a point under x = 15.
void buildScene(SceneBuilder& builder) {
    SceneContext scene(&builder, R, u"ROOT");
    {
        ContainerContext product(&builder, 77, u"Plate", 1);
        {
            SceneLevelContext first(&builder, 1000, u"P.1");
            placeAt(builder, 10);
            SceneLevelContext part(&builder, Group, u"Part");
            EntityTypeContext geometry(&builder, Vis, u"Geometry");
            BodyContext body(&builder, 12, u"Mesh12");
            addTriangle(builder, 0, 0.0f);
        }
        SceneLevelContext second(&builder, 1001, u"P.2");
        placeAt(builder, 20);
        builder.AddNodeReference(pathOf({R, 77, 1000, Group}));
    }
    SceneLevelContext cover(&builder, 3000, u"cover");
    placeAt(builder, 20);
    builder.SetCurrentColor(RGBAColor(255, 0, 0, 255), true);
    builder.SetLineStyle("dashed", -1.0f);
    addTriangle(builder, 1, 4.0f);
    float const across[6] = {-5, 0, 5, -5, 1, 5};
    GeometryItem* const line = builder.GetGeometryItemFactory()->MakePolyline(2, across, 6);
    line->SetColor(RGBAColor(255, 255, 255, 255));
    builder.AddGeometryItem(line);
    builder.AddGeometryItem(builder.GetGeometryItemFactory()->MakePoint(3, -5, 0.3f, 5));
    // Entities always get a node of their own, and their colour only when asked to.
    { EntityContext edge(&builder, 9, u"PMI Edge", true, RGBAColor(0, 128, 0, 200)); }
    EntityContext plain(&builder, 9, u"PMI Edge", false, RGBAColor(0, 128, 0, 200));
}

std::string const Top = "1 scene \"ROOT\"\n  77 container(1) \"Plate\"\n";
std::string const First = "    1000 level \"P.1\" T=[1 0 0 10; 0 1 0 0; 0 0 1 0]\n"
                          "      10007 level \"Part\"\n"
                          "        10006 type \"Geometry\"\n"
                          "          12 body \"Mesh12\" {polygon#0 mode=1 n=3}\n";
std::string const Second = "    1001 level \"P.2\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0]\n";
std::string const Reference = "      -> ref 1/77/1000/10007\n";
std::string const Cover = "  3000 level \"cover\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0] color=255,0,0,255 "
                          "override line=dashed/-1 {polygon#1 mode=1 n=3; polyline#2 pts=2 "
                          "c=255,255,255,255; point#3 at=-5,0.3,5}\n"
                          "    9 entity \"PMI Edge\" color=0,128,0,200\n"
                          "    9 entity \"PMI Edge\"\n";

/// Opens ROOT / Part / one entity in a construction, as renderers do, and tells which of
/// the four contexts were OK ("+") and which not ("-").
std::string openLevels(SceneBuilder& builder) {
    ConstructionContext construction(&builder);
    SceneContext scene(&builder, R, u"ROOT");
    SceneLevelContext part(&builder, Group, u"Part");
    EntityContext face(&builder, 5, u"MeshGeometry", false, RGBAColor());
    std::string ok;
    for (bool const each : {construction.IsOK(), scene.IsOK(), part.IsOK(), face.IsOK()})
        ok += each ? '+' : '-';
    return ok;
}

/// "<leading word>: <tags> at <distance>" for what `ray` hits first; "miss" when Pick
/// leaves both of its outputs alone.
std::string pickedBy(SceneBuilder const& builder, Ray const& ray) {
    RenderId hit(5);
    double distance = -1.0;
    if (!builder.Pick(ray, hit, distance))
        return hit.GetLeading() == 5 && hit.IsEmpty() && distance == -1.0 ? "miss" : "changed";
    std::ostringstream text;
    text << hit.GetLeading() << ':';
    for (std::uint32_t const tag : hit.GetTags())
        text << ' ' << tag;
    text << " at " << distance;
    return text.str();
}

/// What a ray from (x, 0.3, z) along (0, 0, dz) hits first.
std::string picked(SceneBuilder const& builder, double x, double z, double dz) {
    return pickedBy(builder, Ray{{x, 0.3, z}, {0.0, 0.0, dz}});
}

Ray down(double x, double y) {
    return Ray{{x, y, 10.0}, {0.0, 0.0, -1.0}};
}

void placeAt(SceneBuilder& builder, double x, double y, double z) {
    double const matrix[16] = {1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, x, y, z, 1};
    builder.SetCurrentTransform(matrix);
}

/// One level per kind of item below the scene top, each at a height of its own:
///   1 the triangle (0,0) (1,0) (0,1) at z = 0       2 the polyline (10,0) (12,0) (12,2), z = 1
///   3 the line set (20,0)-(22,0), (20,2)-(22,2) and an unpaired (24,2), z = 2
///   4 the point (30,0,3)                              5 a text placed at (40,0,4)
///   6 at x = 100, showing 3 through a reference
///   7, 8, 9 stacked over (50,0): a triangle at z = 0, a point at z = 1, a line along y at z = 2
void buildKinds(SceneBuilder& builder) {
    AGeometryItemFactory& make = *builder.GetGeometryItemFactory();
    SceneContext scene(&builder, R, u"ROOT");
    auto level = [&](std::uint32_t tag, GeometryItem* item) {
        SceneLevelContext node(&builder, tag, u"kind");
        builder.AddGeometryItem(item);
    };
    {
        SceneLevelContext triangle(&builder, 1, u"triangle");
        addTriangle(builder, 1, 0.0f);
    }
    float const polyline[9] = {10, 0, 1, 12, 0, 1, 12, 2, 1};
    level(2, make.MakePolyline(2, polyline, 9));
    float const pairs[15] = {20, 0, 2, 22, 0, 2, 20, 2, 2, 22, 2, 2, 24, 2, 2};
    level(3, make.MakeLineSet(3, pairs, 15));
    level(4, make.MakePoint(4, 30, 0, 3));
    float const anchor[3] = {7, 7, 7}; // the source's, for hosts: it does not move the text
    {
        SceneLevelContext text(&builder, 5, u"text");
        placeAt(builder, 40, 0, 4);
        builder.AddGeometryItem(make.MakeText(5, u"note", u"Arial", anchor, FontAttr(), 0));
    }
    {
        SceneLevelContext placed(&builder, 6, u"placed");
        placeAt(builder, 100);
        builder.AddNodeReference(pathOf({R, 3}));
    }
    {
        SceneLevelContext under(&builder, 7, u"under");
        placeAt(builder, 49.8, -0.2, 0);
        addTriangle(builder, 7, 0.0f);
    }
    level(8, make.MakePoint(8, 50, 0, 1));
    float const across[6] = {50, -1, 2, 50, 1, 2};
    level(9, make.MakePolyline(9, across, 6));
}

} // namespace

TEST(SceneBuilder, ContextsOpenPathsFromTheSceneTopAndCloseAlsoOnAThrow) {
    SceneBuilder builder;
    RenderId id;
    // Destroyed, not leaked, without a node to take it (the sanitizer build tells).
    EXPECT_FALSE(builder.AddGeometryItem(builder.GetGeometryItemFactory()->MakePoint(0, 0, 0, 0)));
    try {
        ConstructionContext construction(&builder);
        EXPECT_FALSE(ContainerContext(&builder, 2, u"product", 1).IsOK()) << "not at the top";
        SceneContext scene(&builder, R, u"ROOT");
        ContainerContext product(&builder, 77, u"Plate", 1);
        SceneLevelContext instance(&builder, 1000, u"P.1");
        EXPECT_TRUE(builder.GetCurrentRenderId(id));
        EXPECT_EQ(id.GetTags(), (Tags{R, 77, 1000}));
        EXPECT_TRUE(builder.IsConstructing());
        EXPECT_FALSE(builder.RemoveNode(pathOf({R, 77}))) << "an open level stays";
        throw std::runtime_error("walk failed");
    } catch (std::runtime_error const&) {
    }
    EXPECT_FALSE(builder.IsConstructing());
    EXPECT_FALSE(builder.GetCurrentRenderId(id));
    EXPECT_EQ(builder.Dump(), Top + "    1000 level \"P.1\"\n") << "closing keeps nodes";
}

// A refused context opens nothing: what follows opens below the current node, if any.
TEST(SceneBuilder, AFaultPlanRefusesTheChosenContextsUntilCleared) {
    struct Case {
        char const* name;
        void (*plan)(SceneBuilder&);
        char const* ok;
    } const cases[] = {
        {"by name", [](SceneBuilder& b) { b.FailContextsNamed(u"Part"); }, "++-+"},
        {"by tag", [](SceneBuilder& b) { b.FailContextsTagged(5); }, "+++-"},
        {"by kind", [](SceneBuilder& b) { b.FailContextsOfKind(ContextKind::Scene); }, "+---"},
        {"the construction",
         [](SceneBuilder& b) { b.FailContextsOfKind(ContextKind::Construction); }, "-+++"},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        SceneBuilder builder;
        c.plan(builder);
        EXPECT_EQ(openLevels(builder), c.ok);
        EXPECT_EQ(builder.GetRefusedContextCount(), 1) << "no parent is no fault of the plan";
        builder.ClearContextFaults();
        EXPECT_EQ(openLevels(builder), "++++");
    }
}

TEST(SceneBuilder, AReferenceSharesTheSubtreeAndNeverLoopsAndTheDumpShowsAllState) {
    SceneBuilder builder;
    buildScene(builder);
    EXPECT_EQ(builder.Dump(), Top + First + Second + Reference + Cover);
    Node const* const shared = builder.FindNode(pathOf({R, 77, 1000, Group}));
    EXPECT_EQ(builder.FindNode(pathOf({R, 77, 1001, Group})), shared);
    EXPECT_EQ(shared->GetReferrerCount(), 1u);
    Matrix4 world;
    ASSERT_TRUE(builder.GetWorldTransform(pathOf({R, 77, 1001, Group, Vis, 12}), world));
    EXPECT_EQ(world.At(0, 3), 20.0) << "placed by the referencing node";
    {
        SceneContext scene(&builder, R, u"ROOT");
        ContainerContext product(&builder, 77, u"Plate", 1);
        SceneLevelContext first(&builder, 1000, u"P.1");
        SceneLevelContext part(&builder, Group, u"Part");
        for (Tags const& refused :
             {Tags{R, 77, 1000, Group}, Tags{R, 77}, Tags{R, 77, 1001}, Tags{R, 4242}})
            EXPECT_FALSE(builder.AddNodeReference(pathOf(refused))) << refused.size();
    }
    {
        // A second render finds its levels again: names stay, a reference is not doubled.
        SceneContext scene(&builder, R, u"ROOT");
        ContainerContext product(&builder, 77, u"renamed", 1);
        SceneLevelContext second(&builder, 1001, u"P.2");
        EXPECT_TRUE(builder.AddNodeReference(pathOf({R, 77, 1000, Group})));
        builder.SetVisibility(false);
    }
    EXPECT_EQ(builder.Dump(), Top + First +
                                  "    1001 level \"P.2\" T=[1 0 0 20; 0 1 0 0; 0 0 1 0] hidden\n" +
                                  Reference + Cover);
    EXPECT_EQ(picked(builder, 20.2, -10, 1), "1: 1 3000 at 14") << "hidden P.2 is not hit";
}

TEST(SceneBuilder, RemovalTakesTheReferencesToTheRemovedSubtreeAlong) {
    struct Case {
        Tags path;
        std::string dump;
    } const cases[] = {
        {{R, 77, 1000}, Top + Second + Cover},
        {{R, 77, 1001, Group}, Top + First + Second + Cover}, // only the reference
        {{R, 77, 1001}, Top + First + Cover},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.path.size());
        SceneBuilder builder;
        buildScene(builder);
        ASSERT_TRUE(builder.RemoveNode(pathOf(c.path)));
        EXPECT_EQ(builder.Dump(), c.dump);
        Node const* const shared = builder.FindNode(pathOf({R, 77, 1000, Group}));
        EXPECT_EQ(shared != nullptr ? shared->GetReferrerCount() : 0u, 0u);
        // P.2's triangle is gone: only the cover above it is hit from below.
        EXPECT_EQ(picked(builder, 20.2, -10, 1), "1: 1 3000 at 14");
    }
}

TEST(SceneBuilder, PicksTheNearestShownTriangleThroughReferencesAndPlacements) {
    SceneBuilder builder;
    buildScene(builder);
    // Distances are in scene units whatever the length of the ray's direction.
    EXPECT_EQ(picked(builder, 10.2, 10, -2), "1: 1 77 1000 10007 10006 12 at 10");
    EXPECT_EQ(picked(builder, 20.2, 10, -2), "1: 1 3000 at 6");
    EXPECT_EQ(picked(builder, 20.2, -10, 0.5), "1: 1 77 1001 10007 10006 12 at 10") << "below";
    EXPECT_EQ(picked(builder, 15, 10, -2), "1: 1 3000 at 5") << "the cover's line";
    EXPECT_EQ(picked(builder, 20.8, 10, -2), "miss") << "outside the hypotenuse";
    EXPECT_EQ(picked(builder, 20.2, 10, 0), "miss") << "a ray without direction";
}

// Picks keep what they measured of the scene while it stays as it was: each change must be
// seen by the next pick, the adapter's kept answer included.
TEST(SceneBuilder, PicksFollowTheSceneAsItChanges) {
    SceneBuilder builder;
    buildScene(builder);
    View3DAdapter adapter(nullptr, &builder);
    auto const viaAdapter = [&adapter](double x) {
        RenderId drawn;
        if (!adapter.PickDrawnRenderId(Ray{{x, 0.3, 10.0}, {0.0, 0.0, -1.0}}, drawn))
            return std::string("miss");
        std::string text;
        for (std::uint32_t const tag : drawn.GetTags())
            text += ' ' + std::to_string(tag);
        return text;
    };
    EXPECT_EQ(picked(builder, 10.2, 10, -2), "1: 1 77 1000 10007 10006 12 at 10");
    EXPECT_EQ(viaAdapter(20.2), " 1 3000") << "the cover";
    ASSERT_TRUE(builder.RemoveNode(pathOf({R, 3000})));
    EXPECT_EQ(viaAdapter(20.2), " 1 77 1000 10007 10006 12") << "P.2 shows P.1's drawing";
    {
        SceneContext scene(&builder, R, u"ROOT");
        SceneLevelContext moved(&builder, 4000, u"Moved");
        placeAt(builder, 40);
        addTriangle(builder, 9, 0.0f);
    }
    EXPECT_EQ(picked(builder, 40.2, 10, -2), "1: 1 4000 at 10") << "a node added after a pick";
    ASSERT_TRUE(builder.RemoveNode(pathOf({R, 77, 1000})));
    EXPECT_EQ(picked(builder, 10.2, 10, -2), "miss");
    EXPECT_EQ(viaAdapter(20.2), "miss") << "the reference went with its target";
}

// Tolerance 0.25; rays straight down from z = 10 unless said otherwise.
TEST(SceneBuilder, PicksLinesPointsAndTextsWithinTheToleranceAndTheNearestOfAllKinds) {
    SceneBuilder builder;
    buildKinds(builder);
    ASSERT_TRUE(builder.SetPickTolerance(0.25));
    struct Case {
        char const* what;
        Ray ray;
        char const* hit;
    } const cases[] = {
        {"triangle", down(0.2, 0.2), "1: 1 1 at 10"},
        {"a surface takes no tolerance", down(0.55, 0.55), "miss"},
        {"polyline", down(11, 0), "1: 1 2 at 9"},
        {"polyline at the tolerance", down(11, 0.25), "1: 1 2 at 9"},
        {"polyline beyond it", down(11, -0.26), "miss"},
        {"polyline's second segment", down(12.25, 1), "1: 1 2 at 9"},
        {"an open polyline", down(11, 1), "miss"},
        {"line set", down(21, 2.2), "1: 1 3 at 8"},
        {"past a segment's end", down(22.2, 0), "1: 1 3 at 8"},
        {"further past it", down(22.3, 0), "miss"},
        {"between pairs", down(21, 1), "miss"},
        {"the unpaired point", down(24, 2), "miss"},
        {"point at the tolerance", down(30, 0.25), "1: 1 4 at 7"},
        {"point diagonally beyond", down(30.2, 0.2), "miss"},
        {"behind the origin", Ray{{30, 0, 2.9}, {0, 0, -1}}, "miss"},
        {"text where its node stands", down(40.1, 0), "1: 1 5 at 6"},
        {"text beside that", down(41, 0), "miss"},
        {"line set through a reference", down(121, 2.2), "1: 1 6 3 at 8"},
        {"across a segment", Ray{{11, -5, 1}, {0, 1, 0}}, "1: 1 2 at 5"},
        {"along a segment: its near end", Ray{{5, 0, 1}, {2, 0, 0}}, "1: 1 2 at 5"},
        {"the line above the point above the triangle", down(50, 0), "1: 1 9 at 8"},
        {"from below the triangle first", Ray{{50, 0, -10}, {0, 0, 1}}, "1: 1 7 at 10"},
        {"beside the line and the point", down(50.3, 0), "1: 1 7 at 10"},
    };
    for (Case const& c : cases)
        EXPECT_EQ(pickedBy(builder, c.ray), c.hit) << c.what;
    {
        SceneContext scene(&builder, R, u"ROOT");
        SceneLevelContext line(&builder, 9, u"kind");
        builder.SetVisibility(false);
    }
    EXPECT_EQ(pickedBy(builder, down(50, 0)), "1: 1 8 at 9") << "the hidden line is passed";
}

TEST(SceneBuilder, ThePickToleranceIsHalfAUnitUntilSetToAFiniteNonNegativeValue) {
    SceneBuilder builder;
    buildKinds(builder);
    EXPECT_EQ(pickedBy(builder, down(30.45, 0)), "1: 1 4 at 7");
    EXPECT_EQ(pickedBy(builder, down(30.55, 0)), "miss");
    using Limits = std::numeric_limits<double>;
    for (double const refused : {-1.0, Limits::quiet_NaN(), Limits::infinity()})
        EXPECT_FALSE(builder.SetPickTolerance(refused)) << refused;
    EXPECT_EQ(pickedBy(builder, down(30.45, 0)), "1: 1 4 at 7") << "refused values change nothing";
    EXPECT_TRUE(builder.SetPickTolerance(0.0));
    EXPECT_EQ(pickedBy(builder, down(30, 0)), "1: 1 4 at 7") << "touching is still a hit";
    EXPECT_EQ(pickedBy(builder, down(30.01, 0)), "miss");
}
