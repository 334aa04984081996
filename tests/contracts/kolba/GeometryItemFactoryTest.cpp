#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>

#include <VizBridge/contracts/kolba/LineSetItem.h>
#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/PolygonItem.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/TextItem.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <gtest/gtest.h>

#include <functional>
#include <memory>

using namespace KolbaVizCore;

namespace {

float const Square[12] = {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0};

std::unique_ptr<GeometryItem> owned(GeometryItem* item) {
    return std::unique_ptr<GeometryItem>(item); // the factory hands its items to the caller
}

} // namespace

TEST(DefaultGeometryItemFactory, RefusesDataThatWouldMakeABrokenItem) {
    int const triangle[3] = {0, 1, 2};
    int const outside[3] = {0, 1, 4};
    int const negative[3] = {0, -1, 2};
    struct Case {
        char const* name;
        std::function<GeometryItem*(AGeometryItemFactory&)> make;
        bool made;
    } const cases[] = {
        {"polygon",
         [&](auto& f) { return f.MakePolygon(0, Square, Square, triangle, 12, 12, 3, 1); }, true},
        {"polygon without normals",
         [&](auto& f) { return f.MakePolygon(0, Square, nullptr, triangle, 12, 0, 3, 3); }, true},
        {"polygon without vertices",
         [&](auto& f) { return f.MakePolygon(0, nullptr, nullptr, triangle, 12, 0, 3, 1); }, false},
        {"polygon with 2 indices",
         [&](auto& f) { return f.MakePolygon(0, Square, nullptr, triangle, 12, 0, 2, 1); }, false},
        {"polygon index past the vertices",
         [&](auto& f) { return f.MakePolygon(0, Square, nullptr, outside, 12, 0, 3, 1); }, false},
        {"polygon negative index",
         [&](auto& f) { return f.MakePolygon(0, Square, nullptr, negative, 12, 0, 3, 1); }, false},
        {"polygon mode 0",
         [&](auto& f) { return f.MakePolygon(0, Square, nullptr, triangle, 12, 0, 3, 0); }, false},
        {"polygon normals of another size",
         [&](auto& f) { return f.MakePolygon(0, Square, Square, triangle, 12, 9, 3, 1); }, false},
        {"polygon coordinates not in threes",
         [&](auto& f) { return f.MakePolygon(0, Square, nullptr, triangle, 11, 0, 3, 1); }, false},
        {"polyline", [](auto& f) { return f.MakePolyline(0, Square, 6); }, true},
        {"polyline of one point", [](auto& f) { return f.MakePolyline(0, Square, 3); }, false},
        {"polyline without floats", [](auto& f) { return f.MakePolyline(0, nullptr, 6); }, false},
        {"line set", [](auto& f) { return f.MakeLineSet(0, Square, 12); }, true},
        {"line set not in threes", [](auto& f) { return f.MakeLineSet(0, Square, 7); }, false},
        {"point", [](auto& f) { return f.MakePoint(0, 1, 2, 3); }, true},
        {"text", [](auto& f) { return f.MakeText(0, u"A", u"Arial", Square, FontAttr(), 0.0f); },
         true},
        {"text without anchor",
         [](auto& f) { return f.MakeText(0, u"A", u"Arial", nullptr, FontAttr(), 0.0f); }, false},
    };
    DefaultGeometryItemFactory factory;
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        EXPECT_EQ(owned(c.make(factory)) != nullptr, c.made);
    }
}

TEST(DefaultGeometryItemFactory, ItemsKeepCopiesOfWhatTheyWereMadeFrom) {
    DefaultGeometryItemFactory factory;
    float anchor[3] = {1, 2, 3};
    FontAttr font;
    font.size = 2.5f;
    auto const text = owned(factory.MakeText(7, u"Note", u"Arial", anchor, font, 0.0f));
    anchor[0] = 99;
    auto const* const textItem = dynamic_cast<TextItem const*>(text.get());
    ASSERT_NE(textItem, nullptr);
    EXPECT_EQ(textItem->GetType(), GeometryItem::Type::Text);
    EXPECT_EQ(textItem->GetTag(), 7u);
    EXPECT_EQ(textItem->GetAnchor()[0], 1.0f);
    EXPECT_EQ(textItem->GetFontAttr(), font);
    EXPECT_EQ(text->Describe(), "text#7 \"Note\" font=\"Arial\" size=2.5");

    auto const segments = owned(factory.MakeLineSet(8, Square, 12));
    EXPECT_EQ(segments->Describe(), "lineset#8 pts=4");
    segments->SetColor(RGBAColor(1, 2, 3, 4));
    EXPECT_EQ(segments->Describe(), "lineset#8 pts=4 c=1,2,3,4");
    Ray down;
    down.origin[2] = 1.0;
    down.direction[2] = -1.0;
    double t = -1.0;
    EXPECT_FALSE(segments->IntersectRay(down, Matrix4(), t)) << "lines cannot be hit";
}

TEST(PolygonItem, ItsModeSaysHowIndicesMakeTriangles) {
    int const indices[5] = {0, 1, 2, 3, 0};
    struct Case {
        int mode;
        std::vector<std::array<int, 3>> triangles;
    } const cases[] = {
        {1, {{0, 1, 2}}},
        {2, {{0, 1, 2}, {1, 2, 3}, {2, 3, 0}}},
        {3, {{0, 1, 2}, {0, 2, 3}, {0, 3, 0}}},
    };
    DefaultGeometryItemFactory factory;
    for (Case const& c : cases) {
        SCOPED_TRACE(c.mode);
        auto const item = owned(factory.MakePolygon(0, Square, nullptr, indices, 12, 0, 5, c.mode));
        auto const* const polygon = dynamic_cast<PolygonItem const*>(item.get());
        ASSERT_NE(polygon, nullptr);
        EXPECT_EQ(polygon->GetTriangles(), c.triangles);
    }
}

TEST(PolygonItem, IsHitFromEitherSideWithinItsPlacement) {
    int const fan[4] = {0, 1, 2, 3};
    DefaultGeometryItemFactory factory;
    auto const square = owned(factory.MakePolygon(0, Square, nullptr, fan, 12, 0, 4, 3));
    double const placement[16] = {2, 0, 0, 0, 0, 2, 0, 0, 0, 0, 2, 0, 5, 0, 0, 1};
    Matrix4 const world(placement); // scaled by 2, moved to x = 5

    struct Case {
        char const* name;
        double x, y, z, dz;
        bool hits;
        double t;
    } const cases[] = {
        {"from above", 6.5, 1.5, 4.0, -1.0, true, 4.0},
        {"from below", 6.5, 1.5, -2.0, 0.5, true, 4.0},
        {"outside the placed square", 7.5, 1.5, 4.0, -1.0, false, 0.0},
        {"pointing away", 6.5, 1.5, 4.0, 1.0, false, 0.0},
        {"in the plane", 6.5, 1.5, 0.0, 0.0, false, 0.0},
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(c.name);
        Ray ray;
        ray.origin[0] = c.x;
        ray.origin[1] = c.y;
        ray.origin[2] = c.z;
        ray.direction[2] = c.dz;
        if (c.dz == 0.0)
            ray.direction[0] = 1.0;
        double t = -1.0;
        EXPECT_EQ(square->IntersectRay(ray, world, t), c.hits);
        EXPECT_DOUBLE_EQ(t, c.hits ? c.t : -1.0);
    }

    VizBox box;
    square->AddToBox(world, box);
    EXPECT_EQ(box.GetLow()[0], 5.0);
    EXPECT_EQ(box.GetHigh()[1], 2.0);
}
