#pragma once

#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

class TarvexInputPSInstance;
class TarvexModelData;

/// A part or sub-assembly of the input structure. A default object, or one whose id the
/// model does not know, is an empty sub-assembly: no names, id 0, no instances.
class TarvexInputPSReference {
public:
    TarvexInputPSReference() = default;
    TarvexInputPSReference(std::shared_ptr<TarvexModelData const> data, unsigned int uniqueId)
        : m_data(std::move(data)), m_uniqueId(uniqueId) {}

    TarvexWString GetReferenceName() const;
    TarvexWString GetStorageName() const;
    bool IsPart() const;
    unsigned int GetUniqueID() const;
    int GetInstancesCount() const;
    /// The instance at `index`; an empty instance when `index` is out of range.
    TarvexInputPSInstance GetInstance(int index) const;
    TarvexPartDocument GetDocument() const;

private:
    std::shared_ptr<TarvexModelData const> m_data;
    unsigned int m_uniqueId = 0;
};
