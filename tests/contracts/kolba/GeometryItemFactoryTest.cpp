#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>

#include <VizBridge/contracts/kolba/GeometryItem.h>
#include <VizBridge/contracts/kolba/PolygonItem.h>

#include <gtest/gtest.h>

#include <array>
#include <memory>
#include <string>
#include <utility>

using namespace KolbaVizCore;

namespace {

float const Square[12] = {0, 0, 0, 1, 0, 0, 1, 1, 0, 0, 1, 0};
int const Indices[5] = {0, 1, 2, 3, 0};
int const Outside[3] = {0, 1, 4};
int const Negative[3] = {0, -1, 2};

/// What an item says of itself in a scene dump, and a polygon's triangles after a colon;
/// empty if the factory refused to make it.
std::string described(GeometryItem* made) {
    std::unique_ptr<GeometryItem> const item(made); // the factory hands it to the caller
    if (item == nullptr)
        return "";
    std::string text = item->Describe();
    if (auto const* const polygon = dynamic_cast<PolygonItem const*>(item.get())) {
        text += ':';
        for (std::array<int, 3> const& t : polygon->GetTriangles())
            text += ' ' + std::to_string(t[0]) + std::to_string(t[1]) + std::to_string(t[2]);
    }
    return text;
}

} // namespace

TEST(DefaultGeometryItemFactory, MakesItemsOnlyOfSoundDataAndPolygonsInThreeModes) {
    DefaultGeometryItemFactory f;
    FontAttr font;
    font.size = 2.5f;
    std::pair<GeometryItem*, std::string> const cases[] = {
        // A list: the indices past the last full triple make nothing.
        {f.MakePolygon(7, Square, Square, Indices, 12, 12, 5, 1), "polygon#7 mode=1 n=5: 012"},
        {f.MakePolygon(7, Square, nullptr, Indices, 12, 0, 5, 2),
         "polygon#7 mode=2 n=5: 012 123 230"},
        {f.MakePolygon(7, Square, nullptr, Indices, 12, 0, 5, 3),
         "polygon#7 mode=3 n=5: 012 023 030"},
        {f.MakePolygon(7, nullptr, nullptr, Indices, 12, 0, 3, 1), ""},
        {f.MakePolygon(7, Square, nullptr, Indices, 12, 0, 2, 1), ""},  // fewer than 3 indices
        {f.MakePolygon(7, Square, nullptr, Outside, 12, 0, 3, 1), ""},  // past the vertices
        {f.MakePolygon(7, Square, nullptr, Negative, 12, 0, 3, 1), ""}, // below them
        {f.MakePolygon(7, Square, nullptr, Indices, 12, 0, 3, 0), ""},  // modes run from 1 to 3
        {f.MakePolygon(7, Square, nullptr, Indices, 12, 0, 3, 4), ""},
        {f.MakePolygon(7, Square, Square, Indices, 12, 9, 3, 1), ""},  // normals of another size
        {f.MakePolygon(7, Square, nullptr, Indices, 11, 0, 3, 1), ""}, // not in threes
        {f.MakePolyline(3, Square, 6), "polyline#3 pts=2"},
        {f.MakePolyline(3, Square, 3), ""}, // one point
        {f.MakeLineSet(4, Square, 12), "lineset#4 pts=4"},
        {f.MakeLineSet(4, Square, 7), ""}, // not in threes
        {f.MakePoint(5, 1, 2.5f, -3), "point#5 at=1,2.5,-3"},
        {f.MakeText(6, u"Note", u"Arial", Square, font, 0.0f),
         "text#6 \"Note\" font=\"Arial\" size=2.5"},
        {f.MakeText(6, u"Note", u"Arial", nullptr, font, 0.0f), ""}, // no anchor
    };
    for (std::size_t row = 0; row < std::size(cases); ++row)
        EXPECT_EQ(described(cases[row].first), cases[row].second) << "row " << row;
}
