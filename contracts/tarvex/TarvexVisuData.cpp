#include <VizBridge/contracts/tarvex/TarvexVisuData.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuData.h>

TarvexVisuNodeIter TarvexVisuData::GetNodeIterator() const {
    TarvexAuthoredVisuData const* const data =
        m_context.Read(m_record, "TarvexVisuData::GetNodeIterator");
    if (data == nullptr) {
        return TarvexVisuNodeIter();
    }
    return TarvexVisuNodeIter(m_context, {m_record, &data->nodes});
}

TarvexLengthUnitType TarvexVisuData::GetUnits() const {
    TarvexAuthoredVisuData const* const data = m_context.Read(m_record, "TarvexVisuData::GetUnits");
    return data == nullptr ? TarvexLengthUnit_Unknown : data->unit;
}

TarvexVisuViewIter TarvexVisuData::GetViewIterator() const {
    TarvexAuthoredVisuData const* const data =
        m_context.Read(m_record, "TarvexVisuData::GetViewIterator");
    if (data == nullptr) {
        return TarvexVisuViewIter();
    }
    return TarvexVisuViewIter(m_context, {m_record, &data->views});
}

TarvexVisuCaptureIter TarvexVisuData::GetCaptureIterator() const {
    TarvexAuthoredVisuData const* const data =
        m_context.Read(m_record, "TarvexVisuData::GetCaptureIterator");
    if (data == nullptr) {
        return TarvexVisuCaptureIter();
    }
    return TarvexVisuCaptureIter(m_context, {m_record, &data->captures});
}
