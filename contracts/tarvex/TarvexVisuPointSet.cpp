#include <VizBridge/contracts/tarvex/TarvexVisuPointSet.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointsIter.h>

TarvexVisuGeometryType TarvexVisuPointSet::GetGeometryType() const {
    TarvexAuthoredVisuPointSet const* const set =
        m_context.Read(m_record, "TarvexVisuPointSet::GetGeometryType");
    return set == nullptr ? TarvexVisuGeometry_Unknown : set->geometryType;
}

TarvexVisuPointsIter TarvexVisuPointSet::GetPointsIterator() const {
    TarvexAuthoredVisuPointSet const* const set =
        m_context.Read(m_record, "TarvexVisuPointSet::GetPointsIterator");
    if (set == nullptr) {
        return TarvexVisuPointsIter();
    }
    return TarvexVisuPointsIter(m_context, {m_record, &set->points});
}
