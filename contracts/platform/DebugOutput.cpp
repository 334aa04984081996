#include <VizBridge/contracts/platform/DebugOutput.h>

#include <memory>
#include <mutex>

namespace VizPort {

namespace {

// The current sink sits behind a shared pointer so that a call in progress keeps the sink it
// started with alive, even when that very sink replaces itself. The mutex is re-entrant so
// that a sink may itself write debug output or change the sink without a deadlock.
struct SinkState {
    std::recursive_mutex mutex;
    std::shared_ptr<DebugSink const> sink;
};

SinkState& sinkState() {
    // A function-local object: other static initialisers may already write debug output.
    static SinkState state;
    return state;
}

} // namespace

void OutputDebugStringW(char16_t const* text) {
    if (text == nullptr)
        return;
    SinkState& state = sinkState();
    // Held during the call: texts of different threads reach the sink one at a time, and a
    // sink that is being replaced is not still running once SetDebugSink has returned.
    std::lock_guard<std::recursive_mutex> const lock(state.mutex);
    std::shared_ptr<DebugSink const> const sink = state.sink;
    if (!sink || !*sink)
        return;
    try {
        (*sink)(text);
    } catch (...) {
        // Debug output never changes the course of the caller, as on Windows: a failing
        // sink loses its text and nothing else.
    }
}

DebugSink SetDebugSink(DebugSink sink) {
    SinkState& state = sinkState();
    std::lock_guard<std::recursive_mutex> const lock(state.mutex);
    std::shared_ptr<DebugSink const> previous = std::move(state.sink);
    if (sink)
        state.sink = std::make_shared<DebugSink const>(std::move(sink));
    // A copy, not a move: the previous sink may be running right now on this thread.
    return previous ? *previous : DebugSink{};
}

} // namespace VizPort
