#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

TarvexWString TarvexPartDocument::GetName() const {
    if (!m_data) {
        return TarvexWString();
    }
    m_data->faults.Check("TarvexPartDocument::GetName", 0);
    TarvexAuthoredReference const* const reference = m_data->FindReference(m_referenceId);
    return reference == nullptr ? TarvexWString() : TarvexWString(reference->name);
}

std::shared_ptr<TarvexConvertedPart const> TarvexPartDocument::GetConvertedPart() const {
    if (!m_data) {
        return nullptr;
    }
    m_data->faults.Check("TarvexPartDocument::GetConvertedPart", 0);
    TarvexAuthoredReference const* const reference = m_data->FindReference(m_referenceId);
    // A sub-assembly has no geometry of its own to convert.
    if (reference == nullptr || !reference->isPart) {
        return nullptr;
    }
    return m_data->conversions.Convert(m_referenceId, reference->geometry);
}

TarvexPMIData TarvexPartDocument::GetPMIData() const {
    if (!m_data) {
        return TarvexPMIData();
    }
    m_data->faults.Check("TarvexPartDocument::GetPMIData", 0);
    return TarvexPMIData(m_data, m_referenceId);
}
