#pragma once

#include <VizBridge/contracts/tarvex/TarvexDocumentInformation.h>

#include <memory>

class TarvexModelData;

/// An opened document. A default object is empty: its information has no values.
class TarvexDocument {
public:
    TarvexDocument() = default;
    explicit TarvexDocument(std::shared_ptr<TarvexModelData const> data)
        : m_data(std::move(data)) {}

    TarvexDocumentInformation GetInformation();

private:
    std::shared_ptr<TarvexModelData const> m_data;
};
