#include <VizBridge/contracts/platform/Sleep.h>

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <limits>
#include <thread>

namespace VizPort {

void Sleep(unsigned long milliseconds) {
    if (milliseconds == 0) {
        // Sleep(0) hands the rest of the time slice to another thread.
        std::this_thread::yield();
        return;
    }
    // unsigned long is 64 bits wide here: keep the count inside the signed tick type.
    using Ticks = std::chrono::milliseconds::rep;
    auto const limit = static_cast<unsigned long>(std::numeric_limits<Ticks>::max());
    std::this_thread::sleep_for(
        std::chrono::milliseconds(static_cast<Ticks>(std::min(milliseconds, limit))));
}

} // namespace VizPort
