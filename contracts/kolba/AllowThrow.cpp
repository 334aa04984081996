#include <VizBridge/contracts/kolba/AllowThrow.h>

#include <atomic>

namespace KolbaVizCore {

namespace {
// Read on every failure path of every thread; an atomic keeps a concurrent switch well defined.
std::atomic<bool> allowThrow{false};
} // namespace

bool GetAllowThrow() {
    return allowThrow.load();
}

void SetAllowThrow(bool allow) {
    allowThrow.store(allow);
}

} // namespace KolbaVizCore
