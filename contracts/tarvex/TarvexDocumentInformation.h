#pragma once

#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

class TarvexModelData;

/// The document strings. Each getter answers whether the value is present and, if it is,
/// fills `value`; otherwise `value` stays as it was. A default object has no values.
class TarvexDocumentInformation {
public:
    TarvexDocumentInformation() = default;
    explicit TarvexDocumentInformation(std::shared_ptr<TarvexModelData const> data)
        : m_data(std::move(data)) {}

    bool GetFileName(TarvexWString& value) const;
    bool GetAuthor(TarvexWString& value) const;
    bool GetOrganization(TarvexWString& value) const;
    bool GetSourceSystem(TarvexWString& value) const;
    bool GetVersion(TarvexWString& value) const;
    bool GetUnit(TarvexWString& value) const;
    bool GetComment(TarvexWString& value) const;
    bool GetFormatType(TarvexWString& value) const;

private:
    std::shared_ptr<TarvexModelData const> m_data;
};
