#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>

#include <VizBridge/contracts/tarvex/TarvexInputPSInstance.h>
#include <VizBridge/contracts/tarvex/TarvexModelData.h>

namespace {

/// Checks the plan for `operation` and gives the record, or null for a default object or an
/// id the model does not know.
TarvexAuthoredReference const* find(TarvexModelData const* data, char const* operation,
                                    unsigned int uniqueId) {
    if (data == nullptr) {
        return nullptr;
    }
    data->faults.Check(operation, uniqueId);
    return data->FindReference(uniqueId);
}

} // namespace

TarvexWString TarvexInputPSReference::GetReferenceName() const {
    auto const* const reference =
        find(m_data.get(), "TarvexInputPSReference::GetReferenceName", m_uniqueId);
    return reference == nullptr ? TarvexWString() : TarvexWString(reference->name);
}

TarvexWString TarvexInputPSReference::GetStorageName() const {
    auto const* const reference =
        find(m_data.get(), "TarvexInputPSReference::GetStorageName", m_uniqueId);
    return reference == nullptr ? TarvexWString() : TarvexWString(reference->storageName);
}

bool TarvexInputPSReference::IsPart() const {
    auto const* const reference = find(m_data.get(), "TarvexInputPSReference::IsPart", m_uniqueId);
    return reference != nullptr && reference->isPart;
}

unsigned int TarvexInputPSReference::GetUniqueID() const {
    auto const* const reference =
        find(m_data.get(), "TarvexInputPSReference::GetUniqueID", m_uniqueId);
    return reference == nullptr ? 0 : reference->uniqueId;
}

int TarvexInputPSReference::GetInstancesCount() const {
    auto const* const reference =
        find(m_data.get(), "TarvexInputPSReference::GetInstancesCount", m_uniqueId);
    return reference == nullptr ? 0 : static_cast<int>(reference->instances.size());
}

TarvexInputPSInstance TarvexInputPSReference::GetInstance(int index) const {
    auto const* const reference =
        find(m_data.get(), "TarvexInputPSReference::GetInstance", m_uniqueId);
    if (reference == nullptr || index < 0 ||
        index >= static_cast<int>(reference->instances.size())) {
        return TarvexInputPSInstance();
    }
    return TarvexInputPSInstance(m_data, reference->instances[static_cast<std::size_t>(index)]);
}

TarvexPartDocument TarvexInputPSReference::GetDocument() const {
    auto const* const reference =
        find(m_data.get(), "TarvexInputPSReference::GetDocument", m_uniqueId);
    return reference == nullptr ? TarvexPartDocument() : TarvexPartDocument(m_data, m_uniqueId);
}
