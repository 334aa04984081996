#pragma once

#include <VizBridge/contracts/tarvex/TarvexInputPSInstance.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexLengthUnitType.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

class TarvexModelData;

/// The product tree of an import: the product's name and unit and its root instances.
/// A default object is an empty product.
class TarvexInputProductStructure {
public:
    TarvexInputProductStructure() = default;
    explicit TarvexInputProductStructure(std::shared_ptr<TarvexModelData const> data)
        : m_data(std::move(data)) {}

    TarvexWString GetProductName() const;
    int GetUniqueReferencesCount() const;
    int GetRootInstancesCount() const;
    /// The root instance at `index`; an empty instance when out of range.
    TarvexInputPSInstance GetRootInstance(int index) const;
    TarvexLengthUnitType GetUnits() const;
    /// The reference with this unique id, or the one TarvexModel::SetSpoolerIdAlias names
    /// for it; an empty reference for an unknown id.
    TarvexInputPSReference GetReferenceFromId(int id) const;

private:
    // The spooler converts the parts of this product without asking the fault plan of every
    // reference on the way.
    friend class TarvexMultiProcessSpooler;

    std::shared_ptr<TarvexModelData const> m_data;
};
