#include <VizBridge/contracts/tarvex/TarvexVisuPolygon.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

int TarvexVisuPolygon::GetPolygonIndices(int const*& indices, TarvexVisuPolygonType& type) const {
    TarvexAuthoredVisuPolygon const* const polygon =
        m_context.Read(m_record, "TarvexVisuPolygon::GetPolygonIndices");
    type = polygon == nullptr ? TarvexVisuPolygon_Unknown : polygon->type;
    return TarvexVisuValues::Indices(
        TarvexVisuValues::Member(polygon, &TarvexAuthoredVisuPolygon::indices), indices);
}
