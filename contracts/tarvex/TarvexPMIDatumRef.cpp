#include <VizBridge/contracts/tarvex/TarvexPMIDatumRef.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumRefModifiedDatumIter.h>

TarvexPMIDatumRefModifiedDatumIter TarvexPMIDatumRef::GetModifiedDatumIterator() const {
    auto const* record = m_context.Read(m_record, "TarvexPMIDatumRef::GetModifiedDatumIterator");
    if (!record) {
        return TarvexPMIDatumRefModifiedDatumIter();
    }
    return TarvexPMIDatumRefModifiedDatumIter(
        m_context, std::shared_ptr<std::vector<TarvexAuthoredPMIModifiedDatum> const>(
                       m_record, &record->datums));
}
