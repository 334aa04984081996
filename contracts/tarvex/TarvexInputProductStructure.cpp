#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

TarvexWString TarvexInputProductStructure::GetProductName() const {
    if (!m_data) {
        return TarvexWString();
    }
    m_data->faults.Check("TarvexInputProductStructure::GetProductName", 0);
    return TarvexWString(m_data->productName);
}

int TarvexInputProductStructure::GetUniqueReferencesCount() const {
    if (!m_data) {
        return 0;
    }
    m_data->faults.Check("TarvexInputProductStructure::GetUniqueReferencesCount", 0);
    return m_data->uniqueReferencesCount ? *m_data->uniqueReferencesCount
                                         : m_data->CountReachableReferences();
}

int TarvexInputProductStructure::GetRootInstancesCount() const {
    if (!m_data) {
        return 0;
    }
    m_data->faults.Check("TarvexInputProductStructure::GetRootInstancesCount", 0);
    return static_cast<int>(m_data->rootInstances.size());
}

TarvexInputPSInstance TarvexInputProductStructure::GetRootInstance(int index) const {
    if (!m_data) {
        return TarvexInputPSInstance();
    }
    m_data->faults.Check("TarvexInputProductStructure::GetRootInstance", 0);
    if (index < 0 || index >= static_cast<int>(m_data->rootInstances.size())) {
        return TarvexInputPSInstance();
    }
    return TarvexInputPSInstance(m_data, m_data->rootInstances[static_cast<std::size_t>(index)]);
}

TarvexLengthUnitType TarvexInputProductStructure::GetUnits() const {
    if (!m_data) {
        return TarvexLengthUnit_Unknown;
    }
    m_data->faults.Check("TarvexInputProductStructure::GetUnits", 0);
    return m_data->unit;
}

TarvexInputPSReference TarvexInputProductStructure::GetReferenceFromId(int id) const {
    if (!m_data) {
        return TarvexInputPSReference();
    }
    m_data->faults.Check("TarvexInputProductStructure::GetReferenceFromId", 0);
    if (id < 0) {
        return TarvexInputPSReference();
    }
    unsigned int const referenceId = m_data->ResolveDeliveredId(static_cast<unsigned int>(id));
    if (m_data->FindReference(referenceId) == nullptr) {
        return TarvexInputPSReference();
    }
    return TarvexInputPSReference(m_data, referenceId);
}
