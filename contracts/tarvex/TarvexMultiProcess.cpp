#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>

#include <algorithm>
#include <atomic>
#include <thread>

namespace {

// Process-wide, and read by whichever thread starts a conversion: atomics, so that a test
// may change them while another thread reads them.
std::atomic<int> g_processorsToUse{0};
/// The physical-processor override; 0 while none is set (a set override is at least 1).
std::atomic<int> g_physicalOverride{0};

int toUseValue(int count) {
    // No count below 0 means anything; 0 already says "all of them".
    return std::max(count, 0);
}

int overrideValue(std::optional<int> count) {
    // A machine has at least one processor, so an override never says fewer.
    return count ? std::max(*count, 1) : 0;
}

std::optional<int> overrideOf(int value) {
    return value == 0 ? std::nullopt : std::optional<int>(value);
}

} // namespace

int TarvexMultiProcess::GetNumberOfProcessorsToUse() {
    return g_processorsToUse.load();
}

void TarvexMultiProcess::SetNumberOfProcessorsToUse(int count) {
    g_processorsToUse.store(toUseValue(count));
}

int TarvexMultiProcess::GetNumberOfPhysicalProcessors() {
    int const override = g_physicalOverride.load();
    if (override != 0) {
        return override;
    }
    // hardware_concurrency gives 0 when the machine does not tell.
    return std::max(static_cast<int>(std::thread::hardware_concurrency()), 1);
}

void TarvexMultiProcess::SetPhysicalProcessorsOverride(std::optional<int> count) {
    g_physicalOverride.store(overrideValue(count));
}

TarvexScopedProcessors::TarvexScopedProcessors(int toUse, std::optional<int> physical)
    : m_toUse(g_processorsToUse.exchange(toUseValue(toUse))),
      m_physical(overrideOf(g_physicalOverride.exchange(overrideValue(physical)))) {}

TarvexScopedProcessors::~TarvexScopedProcessors() {
    g_processorsToUse.store(m_toUse);
    g_physicalOverride.store(overrideValue(m_physical));
}
