#include <VizBridge/contracts/tarvex/TarvexDocumentInformation.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

#include <optional>

namespace {

using DocumentField = std::optional<VizPort::WString> TarvexAuthoredDocument::*;

bool getField(TarvexModelData const* data, char const* operation, DocumentField field,
              TarvexWString& value) {
    if (data == nullptr) {
        return false;
    }
    data->faults.Check(operation, 0);
    std::optional<VizPort::WString> const& text = data->document.*field;
    if (!text) {
        return false;
    }
    value = TarvexWString(*text);
    return true;
}

} // namespace

bool TarvexDocumentInformation::GetFileName(TarvexWString& value) const {
    return getField(m_data.get(), "TarvexDocumentInformation::GetFileName",
                    &TarvexAuthoredDocument::fileName, value);
}

bool TarvexDocumentInformation::GetAuthor(TarvexWString& value) const {
    return getField(m_data.get(), "TarvexDocumentInformation::GetAuthor",
                    &TarvexAuthoredDocument::author, value);
}

bool TarvexDocumentInformation::GetOrganization(TarvexWString& value) const {
    return getField(m_data.get(), "TarvexDocumentInformation::GetOrganization",
                    &TarvexAuthoredDocument::organization, value);
}

bool TarvexDocumentInformation::GetSourceSystem(TarvexWString& value) const {
    return getField(m_data.get(), "TarvexDocumentInformation::GetSourceSystem",
                    &TarvexAuthoredDocument::sourceSystem, value);
}

bool TarvexDocumentInformation::GetVersion(TarvexWString& value) const {
    return getField(m_data.get(), "TarvexDocumentInformation::GetVersion",
                    &TarvexAuthoredDocument::version, value);
}

bool TarvexDocumentInformation::GetUnit(TarvexWString& value) const {
    return getField(m_data.get(), "TarvexDocumentInformation::GetUnit",
                    &TarvexAuthoredDocument::unit, value);
}

bool TarvexDocumentInformation::GetComment(TarvexWString& value) const {
    return getField(m_data.get(), "TarvexDocumentInformation::GetComment",
                    &TarvexAuthoredDocument::comment, value);
}

bool TarvexDocumentInformation::GetFormatType(TarvexWString& value) const {
    return getField(m_data.get(), "TarvexDocumentInformation::GetFormatType",
                    &TarvexAuthoredDocument::formatType, value);
}
