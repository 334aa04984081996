#include "loaders/VizPolygonLoader.h"

#include "contracts/kolba/TriangleType.h"
#include "contracts/kolba/VizPolygon.h"

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
    : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizPolygonLoader::loadOne() {
    auto* const polygon = dynamic_cast<VizPolygon*>(makeOne());
    if (polygon == nullptr)
        return nullptr;

    int const* indices = nullptr;
    TarvexVisuPolygonType type = TarvexVisuPolygon_Unknown;
    int const count = m_source->GetPolygonIndices(indices, type);
    // The indices stay offsets into the face's arrays: the renderer resolves them there. A
    // polygon without indices is kept, with none.
    polygon->SetIndices(count > 0 ? static_cast<unsigned int>(count) : 0u, indices);
    polygon->SetPolygonType(toTriangleType(type));
    return polygon;
}

} // namespace VizBridgeTarvex
