#pragma once

#include <cstdio>
#include <string>

namespace VizBridgeImporter {

/// A progress bar on one line of a terminal, redrawn in place; silent when the stream is no
/// terminal, so that logs stay clean. Points at the stream without owning it.
class ProgressBar {
public:
    explicit ProgressBar(std::FILE* stream, bool enabled);
    ProgressBar(ProgressBar const&) = delete;
    ProgressBar& operator=(ProgressBar const&) = delete;
    /// Clears the line if something is still drawn.
    ~ProgressBar();

    void Show(int current, int total, std::string const& text);
    void Clear();

private:
    std::FILE* m_stream; ///< not owned
    bool m_enabled;
    bool m_drawn = false;
};

} // namespace VizBridgeImporter
