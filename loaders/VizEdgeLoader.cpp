#include <VizBridge/loaders/VizEdgeLoader.h>

#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>
#include <VizBridge/loaders/IndexedPoints.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/loaders/VisuColor.h>

#include <cstddef>

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;

namespace {

VizEdge::EdgeType toEdgeType(TarvexVisuLineType const type) {
    switch (type) {
    case TarvexVisuLine_Polyline:
        return VizEdge::Polyline;
    case TarvexVisuLine_ClosedPolyline:
        return VizEdge::ClosedPolyline;
    case TarvexVisuLine_Segments:
        return VizEdge::LineSegments;
    default:
        return VizEdge::UndefinedLine;
    }
}

} // namespace

VizEdgeLoader::VizEdgeLoader(TarvexVisuEdge const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

KolbaVizCore::VizElement* VizEdgeLoader::loadOne() {
    auto* const edge = dynamic_cast<VizEdge*>(makeOne());
    if (edge == nullptr)
        return nullptr;

    TarvexWString mechanicalId;
    if (m_source->GetMechanicalID(mechanicalId))
        edge->SetMechanicalID(textOrEmpty(mechanicalId));

    float const* points = nullptr;
    int const pointFloats = m_source->GetPoints(points);
    int const* indices = nullptr;
    TarvexVisuLineType lineType = TarvexVisuLine_Unknown;
    int const indexCount = m_source->GetLineIndices(indices, lineType);
    // An edge without an index array draws nothing; the unused element goes with the run.
    if (indices == nullptr)
        return nullptr;
    int const count = indexCount > 0 ? indexCount : 0;

    edge->SetLineType(toEdgeType(lineType));

    KolbaVizCore::RGBAColor color;
    if (resolveVisuColor(*m_source, m_attributes, color, m_inheritAttributes))
        edge->SetColor(color);

    bool const closed = lineType == TarvexVisuLine_ClosedPolyline;
    std::vector<float> vertices;
    vertices.reserve(3 * (static_cast<std::size_t>(count) + 1));
    if (!appendIndexedPoints(points, pointFloats, indices, count, vertices))
        return nullptr;
    // A closed line repeats its first point at its end; without a point there is none.
    if (closed && count > 0)
        for (std::size_t i = 0; i < 3; ++i)
            vertices.push_back(vertices[i]);
    edge->SetVertices(vertices);
    return edge;
}

} // namespace VizBridgeTarvex
