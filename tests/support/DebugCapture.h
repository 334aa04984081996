#pragma once

#include <VizBridge/contracts/platform/DebugOutput.h>

#include <vector>

/// Collects every debug text while it lives, then puts the previous sink back.
class DebugCapture {
public:
    DebugCapture()
        : m_sink([this](char16_t const* text) { m_texts.emplace_back(text ? text : u""); }) {}
    std::vector<VizPort::WString> const& texts() const { return m_texts; }

private:
    std::vector<VizPort::WString> m_texts;
    VizPort::ScopedDebugSink m_sink;
};
