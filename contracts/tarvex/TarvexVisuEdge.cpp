#include <VizBridge/contracts/tarvex/TarvexVisuEdge.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Edge = TarvexAuthoredVisuEdge;

bool TarvexVisuEdge::GetMechanicalID(TarvexWString& id) const {
    Edge const* const edge = m_context.Read(m_record, "TarvexVisuEdge::GetMechanicalID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(edge, &Edge::mechanicalId), id);
}

int TarvexVisuEdge::GetPoints(float const*& points) const {
    Edge const* const edge = m_context.Read(m_record, "TarvexVisuEdge::GetPoints");
    return TarvexVisuValues::Floats(TarvexVisuValues::Member(edge, &Edge::points), points);
}

int TarvexVisuEdge::GetLineIndices(int const*& indices, TarvexVisuLineType& type) const {
    Edge const* const edge = m_context.Read(m_record, "TarvexVisuEdge::GetLineIndices");
    type = edge == nullptr ? TarvexVisuLine_Unknown : edge->lineType;
    return TarvexVisuValues::Indices(TarvexVisuValues::Member(edge, &Edge::lineIndices), indices);
}

bool TarvexVisuEdge::GetRGBColor(unsigned short& red, unsigned short& green,
                                 unsigned short& blue) const {
    Edge const* const edge = m_context.Read(m_record, "TarvexVisuEdge::GetRGBColor");
    return TarvexVisuValues::Rgb(TarvexVisuValues::Member(edge, &Edge::rgb), red, green, blue);
}

bool TarvexVisuEdge::GetAlphaColor(unsigned short& alpha) const {
    Edge const* const edge = m_context.Read(m_record, "TarvexVisuEdge::GetAlphaColor");
    return TarvexVisuValues::Alpha(TarvexVisuValues::Member(edge, &Edge::alpha), alpha);
}
