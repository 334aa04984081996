#include <VizBridge/contracts/tarvex/TarvexVisuWire.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Wire = TarvexAuthoredVisuWire;

bool TarvexVisuWire::GetID(TarvexWString& id) const {
    Wire const* const wire = m_context.Read(m_record, "TarvexVisuWire::GetID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(wire, &Wire::id), id);
}

TarvexVisuGeometryType TarvexVisuWire::GetGeometryType() const {
    Wire const* const wire = m_context.Read(m_record, "TarvexVisuWire::GetGeometryType");
    return wire == nullptr ? TarvexVisuGeometry_Unknown : wire->geometryType;
}

TarvexVisuEdgeIter TarvexVisuWire::GetEdgeIterator() const {
    Wire const* const wire = m_context.Read(m_record, "TarvexVisuWire::GetEdgeIterator");
    if (wire == nullptr) {
        return TarvexVisuEdgeIter();
    }
    return TarvexVisuEdgeIter(m_context, {m_record, &wire->edges});
}
