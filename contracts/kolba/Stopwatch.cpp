#include <VizBridge/contracts/kolba/Stopwatch.h>

namespace KolbaVizCore {

void Stopwatch::Start() {
    if (m_running)
        return;
    m_started = Clock::now();
    m_running = true;
}

void Stopwatch::Stop() {
    if (!m_running)
        return;
    m_total += Clock::now() - m_started;
    m_running = false;
}

double Stopwatch::GetElapsedTime() const {
    Clock::duration elapsed = m_total;
    if (m_running)
        elapsed += Clock::now() - m_started;
    return std::chrono::duration<double>(elapsed).count();
}

void Stopwatch::Reset() {
    m_total = Clock::duration::zero();
    m_running = false;
}

} // namespace KolbaVizCore
