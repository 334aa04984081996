#include <VizBridge/loaders/VizPolygonLoader.h>

#include <VizBridge/contracts/kolba/TriangleType.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/loaders/TarvexValues.h>

namespace VizBridgeTarvex {

using KolbaVizCore::VizPolygon;

namespace {

KolbaVizCore::TriangleType toTriangleType(TarvexVisuPolygonType const type) {
    switch (type) {
    case TarvexVisuPolygon_Triangles:
        return KolbaVizCore::Triangles;
    case TarvexVisuPolygon_TriangleStrip:
        return KolbaVizCore::TriangleStrip;
    case TarvexVisuPolygon_TriangleFan:
        return KolbaVizCore::TriangleFan;
    default:
        return KolbaVizCore::UndefinedTriangles;
    }
}

} // namespace

VizPolygonLoader::VizPolygonLoader(TarvexVisuPolygon const& source,
                                   std::vector<TarvexVisuAttributes>* attributes,
                                   bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

KolbaVizCore::VizElement* VizPolygonLoader::loadOne() {
    auto* const polygon = dynamic_cast<VizPolygon*>(makeOne());
    if (polygon == nullptr)
        return nullptr;

    int const* indices = nullptr;
    TarvexVisuPolygonType type = TarvexVisuPolygon_Unknown;
    int const count = m_source->GetPolygonIndices(indices, type);
    // The indices stay offsets into the face's arrays: the renderer resolves them there. A
    // polygon without indices is kept, with none.
    polygon->SetIndices(countHint(count), indices);
    polygon->SetPolygonType(toTriangleType(type));
    return polygon;
}

} // namespace VizBridgeTarvex
