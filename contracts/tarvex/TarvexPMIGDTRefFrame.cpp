#include <VizBridge/contracts/tarvex/TarvexPMIGDTRefFrame.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumRefIter.h>

TarvexWString TarvexPMIGDTRefFrame::GetLabel() const {
    auto const* record = m_context.Read(m_record, "TarvexPMIGDTRefFrame::GetLabel");
    return record ? TarvexWString(record->label) : TarvexWString();
}

TarvexPMIDatumRefIter TarvexPMIGDTRefFrame::GetDatumRefIterator() const {
    auto const* record = m_context.Read(m_record, "TarvexPMIGDTRefFrame::GetDatumRefIterator");
    if (!record) {
        return TarvexPMIDatumRefIter();
    }
    return TarvexPMIDatumRefIter(m_context,
                                 std::shared_ptr<std::vector<TarvexAuthoredPMIDatumRef> const>(
                                     m_record, &record->references));
}
