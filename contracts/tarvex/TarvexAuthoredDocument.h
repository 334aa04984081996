#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <optional>

/// The document strings as a host or test describes them; each may be absent.
struct TarvexAuthoredDocument {
    std::optional<VizPort::WString> fileName;
    std::optional<VizPort::WString> author;
    std::optional<VizPort::WString> organization;
    std::optional<VizPort::WString> sourceSystem;
    std::optional<VizPort::WString> version;
    std::optional<VizPort::WString> unit;
    std::optional<VizPort::WString> comment;
    std::optional<VizPort::WString> formatType;
};
