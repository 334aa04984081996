#pragma once

#include <chrono>

namespace KolbaVizCore {

/// Sums the time between Start and Stop pairs. A Start while running and a Stop while
/// stopped are ignored.
class Stopwatch {
public:
    void Start();
    void Stop();
    bool IsRunning() const { return m_running; }
    /// Seconds summed over the finished pairs, plus the running one if any.
    double GetElapsedTime() const;
    void Reset();

private:
    using Clock = std::chrono::steady_clock;
    Clock::duration m_total{};
    Clock::time_point m_started{};
    bool m_running = false;
};

} // namespace KolbaVizCore
