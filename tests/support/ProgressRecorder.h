#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <string>

/// Records the import's progress calls, a line each: "current/total text", or "current/total"
/// for a null text. The callback is a plain function pointer, so the lines go to one
/// process-wide text that each recorder clears when it starts.
class ProgressRecorder {
public:
    ProgressRecorder() { text().clear(); }
    static void callback(int const& current, int const& total, char16_t const* message) {
        text() += std::to_string(current) + '/' + std::to_string(total) +
                  (message ? ' ' + VizPort::Narrow(message) : std::string()) + '\n';
    }
    static std::string& text() {
        static std::string lines;
        return lines;
    }
};
