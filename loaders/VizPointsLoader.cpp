#include <VizBridge/loaders/VizPointsLoader.h>

#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/VizPoints.h>
#include <VizBridge/loaders/IndexedPoints.h>
#include <VizBridge/loaders/VisuColor.h>

#include <cstddef>

namespace VizBridgeTarvex {

using KolbaVizCore::VizPoints;

VizPointsLoader::VizPointsLoader(TarvexVisuPoints const& source,
                                 std::vector<TarvexVisuAttributes>* attributes,
                                 bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

KolbaVizCore::VizElement* VizPointsLoader::loadOne() {
    auto* const points = dynamic_cast<VizPoints*>(makeOne());
    if (points == nullptr)
        return nullptr;

    float const* coordinates = nullptr;
    int const coordinateFloats = m_source->GetPoints(coordinates);
    int const* indices = nullptr;
    int const indexCount = m_source->GetPointIndices(indices);
    if (indices == nullptr)
        return nullptr;
    int const count = indexCount > 0 ? indexCount : 0;

    KolbaVizCore::RGBAColor color;
    if (resolveVisuColor(*m_source, m_attributes, color, m_inheritAttributes))
        points->SetColor(color);

    std::vector<float> vertices;
    vertices.reserve(3 * static_cast<std::size_t>(count));
    if (!appendIndexedPoints(coordinates, coordinateFloats, indices, count, vertices))
        return nullptr;
    points->SetVertices(vertices);
    return points;
}

} // namespace VizBridgeTarvex
