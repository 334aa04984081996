#pragma once

#include "contracts/tarvex/TarvexWString.h"

#include <memory>

class TarvexModelData;

/// The document of one part reference, which a modeler imports. A default object names no
/// part.
class TarvexPartDocument {
public:
    TarvexPartDocument() = default;
    TarvexPartDocument(std::shared_ptr<TarvexModelData const> data, unsigned int referenceId)
        : m_data(std::move(data)), m_referenceId(referenceId) {}

    bool IsValid() const { return m_data != nullptr; }
    unsigned int GetReferenceId() const { return m_referenceId; }
    TarvexWString GetName() const;

private:
    std::shared_ptr<TarvexModelData const> m_data;
    unsigned int m_referenceId = 0;
};
