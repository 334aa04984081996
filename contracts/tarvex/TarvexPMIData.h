#pragma once

#include <memory>

class TarvexModelData;

/// The PMI objects of a part or product. A default object holds none.
class TarvexPMIData {
public:
    TarvexPMIData() = default;
    TarvexPMIData(std::shared_ptr<TarvexModelData const> data, unsigned int referenceId)
        : m_data(std::move(data)), m_referenceId(referenceId) {}

    bool IsValid() const { return m_data != nullptr; }
    unsigned int GetReferenceId() const { return m_referenceId; }

private:
    // The result of a part import asks the fault plan of the model its PMI belongs to.
    friend class TarvexPartImportResult;

    std::shared_ptr<TarvexModelData const> m_data;
    unsigned int m_referenceId = 0;
};
