#pragma once

#include "contracts/tarvex/TarvexFault.h"

#include <mutex>
#include <vector>

/// The faults planned for one model. Every operation of the model's value objects asks the
/// plan before it answers, so a test can make any of them throw. Thread-safe.
class TarvexFaultPlan {
public:
    void Add(TarvexFault fault);
    void Clear();
    /// How many times a planned fault has fired so far.
    int GetFiredCount() const;

    /// Throws if a planned fault matches `operation` on `subject`; otherwise returns.
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
