#include <VizBridge/contracts/tarvex/TarvexVisuPMI.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuTextIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using PMI = TarvexAuthoredVisuPMI;

TarvexVisuEdgeIter TarvexVisuPMI::GetEdgeIterator() const {
    PMI const* const pmi = m_context.Read(m_record, "TarvexVisuPMI::GetEdgeIterator");
    if (pmi == nullptr) {
        return TarvexVisuEdgeIter();
    }
    return TarvexVisuEdgeIter(m_context, {m_record, &pmi->edges});
}

TarvexVisuTextIter TarvexVisuPMI::GetTextIterator() const {
    PMI const* const pmi = m_context.Read(m_record, "TarvexVisuPMI::GetTextIterator");
    if (pmi == nullptr) {
        return TarvexVisuTextIter();
    }
    return TarvexVisuTextIter(m_context, {m_record, &pmi->texts});
}

TarvexWString TarvexVisuPMI::GetDisplayName() const {
    PMI const* const pmi = m_context.Read(m_record, "TarvexVisuPMI::GetDisplayName");
    return TarvexVisuValues::TextOrNone(TarvexVisuValues::Member(pmi, &PMI::displayName));
}

bool TarvexVisuPMI::GetID(TarvexWString& id) const {
    PMI const* const pmi = m_context.Read(m_record, "TarvexVisuPMI::GetID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(pmi, &PMI::id), id);
}

bool TarvexVisuPMI::GetMechanicalID(TarvexWString& id) const {
    PMI const* const pmi = m_context.Read(m_record, "TarvexVisuPMI::GetMechanicalID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(pmi, &PMI::mechanicalId), id);
}

TarvexEntityIter TarvexVisuPMI::GetLinkedElementIterator() const {
    PMI const* const pmi = m_context.Read(m_record, "TarvexVisuPMI::GetLinkedElementIterator");
    if (pmi == nullptr) {
        return TarvexEntityIter();
    }
    return TarvexEntityIter(m_context, {m_record, &pmi->linkedElements});
}
