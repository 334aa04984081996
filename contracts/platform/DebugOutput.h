#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <functional>

namespace VizPort {

/// Receives one debug text per call, as OutputDebugStringW would.
using DebugSink = std::function<void(char16_t const* text)>;

/// Sends one text to the process-wide debug sink. Silent unless a sink is set.
/// A null text is ignored. Safe to call from any thread.
void OutputDebugStringW(char16_t const* text);

/// Replaces the process-wide sink and returns the one it replaces. An empty sink is silent.
DebugSink SetDebugSink(DebugSink sink);

/// Restores the previous sink when it goes out of scope; tests use it to capture output.
class ScopedDebugSink {
public:
    explicit ScopedDebugSink(DebugSink sink) : m_previous(SetDebugSink(std::move(sink))) {}
    ~ScopedDebugSink() { SetDebugSink(std::move(m_previous)); }
    ScopedDebugSink(ScopedDebugSink const&) = delete;
    ScopedDebugSink& operator=(ScopedDebugSink const&) = delete;

private:
    DebugSink m_previous;
};

} // namespace VizPort
