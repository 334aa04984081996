#pragma once

#include <VizBridge/contracts/tarvex/TarvexFault.h>

#include <mutex>
#include <vector>

/// The faults planned for one model. Every operation of the model's value objects asks the
/// plan before it answers, so a test can make any of them throw. Thread-safe.
class TarvexFaultPlan {
public:
    void Add(TarvexFault fault);
    /// Removes every planned fault and sets the fired count back to 0.
    void Clear();
    /// How many times a planned fault has fired since the plan was made or cleared.
    int GetFiredCount() const;

    /// Throws if a planned fault matches `operation` on `subject`; otherwise returns. Every
    /// matching fault counts the call against its skip; when several are due, the one added
    /// first throws.
    void Check(char const* operation, unsigned int subject) const;

private:
    struct Entry {
        TarvexFault fault;
        int seen = 0;
        int fired = 0;
    };
    mutable std::mutex m_mutex;
    mutable std::vector<Entry> m_entries;
    mutable int m_firedCount = 0;
};
