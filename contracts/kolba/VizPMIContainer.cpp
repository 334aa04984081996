#include "contracts/kolba/VizPMIContainer.h"

namespace KolbaVizCore {

void VizPMIContainer::AddSemanticPMI(SemanticPMI* record) {
    if (record == nullptr)
        return;
    // Owned from here on, so that the record is freed even if filing it fails.
    std::unique_ptr<SemanticPMI> owned(record);
    std::unique_ptr<SemanticPMI>& slot = m_semanticPMI[owned->ID];
    if (slot == owned) {
        // Handed back while already filed here: it must stay alive.
        static_cast<void>(owned.release());
        return;
    }
    slot = std::move(owned);
}

bool VizPMIContainer::GetSemanticPMI(VizPort::WString const& key, SemanticPMI*& out) const {
    auto const found = m_semanticPMI.find(key);
    if (found == m_semanticPMI.end())
        return false;
    out = found->second.get();
    return true;
}

bool VizPMIContainer::GetSemanticPMIAsString(VizPort::WString const& key,
                                             VizPort::WString& text) const {
    auto const found = m_semanticPMI.find(key);
    if (found == m_semanticPMI.end())
        return false;
    text = found->second->ToString();
    return true;
}

} // namespace KolbaVizCore
