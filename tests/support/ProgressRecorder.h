#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <optional>
#include <ostream>
#include <vector>

/// One call of the import's progress callback; a null text is kept as no text.
struct ProgressCall {
    int current;
    int total;
    std::optional<VizPort::WString> text;
    bool operator==(ProgressCall const& o) const {
        return current == o.current && total == o.total && text == o.text;
    }
};

inline std::ostream& operator<<(std::ostream& os, ProgressCall const& call) {
    return os << '(' << call.current << ", " << call.total << ", "
              << (call.text ? '"' + VizPort::Narrow(*call.text) + '"' : std::string("null")) << ')';
}

/// The callback is a plain function pointer, so the calls go to one process-wide list that
/// each recorder clears when it starts.
class ProgressRecorder {
public:
    ProgressRecorder() { calls().clear(); }
    static void callback(int const& current, int const& total, char16_t const* text) {
        calls().push_back(
            {current, total, text ? std::optional<VizPort::WString>(text) : std::nullopt});
    }
    static std::vector<ProgressCall>& calls() {
        static std::vector<ProgressCall> list;
        return list;
    }
};
