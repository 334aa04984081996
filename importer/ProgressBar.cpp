#include "ProgressBar.h"

#include <algorithm>
#include <unistd.h>

namespace VizBridgeImporter {

namespace {
constexpr int kWidth = 30;
constexpr std::size_t kTextWidth = 40;
} // namespace

ProgressBar::ProgressBar(std::FILE* stream, bool enabled)
    : m_stream(stream), m_enabled(enabled && stream != nullptr && isatty(fileno(stream)) == 1) {}

ProgressBar::~ProgressBar() {
    Clear();
}

void ProgressBar::Show(int current, int total, std::string const& text) {
    if (!m_enabled)
        return;
    int const filled = total > 0 ? std::clamp(current * kWidth / total, 0, kWidth) : 0;
    std::string const bar = std::string(static_cast<std::size_t>(filled), '#') +
                            std::string(static_cast<std::size_t>(kWidth - filled), ' ');
    std::string const shown = text.size() > kTextWidth ? text.substr(0, kTextWidth) : text;
    std::fprintf(m_stream, "\r[%s] %d/%d %-40s", bar.c_str(), current, total, shown.c_str());
    std::fflush(m_stream);
    m_drawn = true;
}

void ProgressBar::Clear() {
    if (!m_drawn)
        return;
    std::fprintf(m_stream, "\r%*s\r", kWidth + 60, "");
    std::fflush(m_stream);
    m_drawn = false;
}

} // namespace VizBridgeImporter
