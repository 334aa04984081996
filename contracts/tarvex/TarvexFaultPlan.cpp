#include <VizBridge/contracts/tarvex/TarvexFaultPlan.h>

#include <climits>
#include <optional>
#include <stdexcept>

void TarvexFaultPlan::Add(TarvexFault fault) {
    std::lock_guard<std::mutex> const lock(m_mutex);
    m_entries.push_back(Entry{std::move(fault)});
}

void TarvexFaultPlan::Clear() {
    std::lock_guard<std::mutex> const lock(m_mutex);
    m_entries.clear();
    m_firedCount = 0;
}

int TarvexFaultPlan::GetFiredCount() const {
    std::lock_guard<std::mutex> const lock(m_mutex);
    return m_firedCount;
}

void TarvexFaultPlan::Check(char const* operation, unsigned int subject) const {
    // What to throw is copied out under the lock: another thread may Clear the plan as soon
    // as it is released.
    std::optional<TarvexFault> due;
    {
        std::lock_guard<std::mutex> const lock(m_mutex);
        // Every matching entry counts the call, so that each one's skip is measured in calls
        // of its operation; when several are due, the first one added throws.
        for (Entry& entry : m_entries) {
            if (entry.fault.operation != operation ||
                (entry.fault.subject && *entry.fault.subject != subject)) {
                continue;
            }
            if (entry.seen < entry.fault.skip) {
                ++entry.seen;
                continue;
            }
            if (entry.fault.times >= 0 && entry.fired >= entry.fault.times) {
                continue;
            }
            if (!due) {
                due = entry.fault;
                // An endless fault would overflow its counts; they stop at the limit.
                if (entry.fired < INT_MAX) {
                    ++entry.fired;
                }
                if (m_firedCount < INT_MAX) {
                    ++m_firedCount;
                }
            }
        }
    }
    if (!due) {
        return;
    }
    if (due->kind == TarvexFaultKind::StdException) {
        throw std::runtime_error(due->what);
    }
    throw TarvexForeignError{};
}
