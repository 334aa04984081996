#include <VizBridge/contracts/tarvex/TarvexVisuPoints.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Points = TarvexAuthoredVisuPoints;

int TarvexVisuPoints::GetPoints(float const*& points) const {
    Points const* const record = m_context.Read(m_record, "TarvexVisuPoints::GetPoints");
    return TarvexVisuValues::Floats(TarvexVisuValues::Member(record, &Points::points), points);
}

int TarvexVisuPoints::GetPointIndices(int const*& indices) const {
    Points const* const record = m_context.Read(m_record, "TarvexVisuPoints::GetPointIndices");
    return TarvexVisuValues::Indices(TarvexVisuValues::Member(record, &Points::pointIndices),
                                     indices);
}

bool TarvexVisuPoints::GetRGBColor(unsigned short& red, unsigned short& green,
                                   unsigned short& blue) const {
    Points const* const record = m_context.Read(m_record, "TarvexVisuPoints::GetRGBColor");
    return TarvexVisuValues::Rgb(TarvexVisuValues::Member(record, &Points::rgb), red, green, blue);
}

bool TarvexVisuPoints::GetAlphaColor(unsigned short& alpha) const {
    Points const* const record = m_context.Read(m_record, "TarvexVisuPoints::GetAlphaColor");
    return TarvexVisuValues::Alpha(TarvexVisuValues::Member(record, &Points::alpha), alpha);
}
