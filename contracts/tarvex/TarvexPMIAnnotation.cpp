#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

// The linked elements are the annotation's own; the model is only asked for its fault plan.

int TarvexPMIAnnotation::GetLinkedElementsCount() const {
    if (m_data) {
        m_data->faults.Check("TarvexPMIAnnotation::GetLinkedElementsCount", 0);
    }
    return static_cast<int>(m_linked.size());
}

void TarvexPMIAnnotation::GetLinkedElement(int index, TarvexEntity& entity) const {
    if (m_data) {
        m_data->faults.Check("TarvexPMIAnnotation::GetLinkedElement", 0);
    }
    if (index < 0 || index >= static_cast<int>(m_linked.size())) {
        return;
    }
    entity = m_linked[static_cast<std::size_t>(index)];
}
