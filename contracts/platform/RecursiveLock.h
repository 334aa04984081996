#pragma once

#include <mutex>

namespace VizPort {

/// The critical section of the port: a lock that the thread holding it may take again.
/// The Windows spin count has no portable counterpart and is accepted and ignored.
class RecursiveLock {
public:
    explicit RecursiveLock(unsigned long spinCount = 0) { (void)spinCount; }
    RecursiveLock(RecursiveLock const&) = delete;
    RecursiveLock& operator=(RecursiveLock const&) = delete;

    void Enter() { m_mutex.lock(); }
    bool TryEnter() { return m_mutex.try_lock(); }
    void Leave() { m_mutex.unlock(); }

    // BasicLockable, so std::lock_guard and std::scoped_lock work with it.
    void lock() { Enter(); }
    void unlock() { Leave(); }

private:
    std::recursive_mutex m_mutex;
};

} // namespace VizPort
