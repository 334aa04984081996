#pragma once

#include <VizBridge/contracts/tarvex/TarvexInputPSMissingFileIter.h>

#include <memory>

class TarvexModelData;

/// What a product-structure import reports beside the structure itself.
class TarvexPSImportResult {
public:
    TarvexPSImportResult() = default;
    explicit TarvexPSImportResult(std::shared_ptr<TarvexModelData const> data)
        : m_data(std::move(data)) {}

    TarvexInputPSMissingFileIter GetMissingFileIterator() const;

private:
    std::shared_ptr<TarvexModelData const> m_data;
};
