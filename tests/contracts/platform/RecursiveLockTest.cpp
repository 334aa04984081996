#include <VizBridge/contracts/platform/RecursiveLock.h>

#include <gtest/gtest.h>

#include <atomic>
#include <mutex>
#include <thread>

using VizPort::RecursiveLock;

TEST(RecursiveLock, TheHoldingThreadMayEnterAgain) {
    RecursiveLock lock(1024);
    lock.Enter();
    EXPECT_TRUE(lock.TryEnter());
    { std::lock_guard<RecursiveLock> const guard(lock); }
    lock.Leave();
    lock.Leave();

    // Fully released: another thread gets it now.
    bool taken = false;
    std::thread other([&] {
        taken = lock.TryEnter();
        if (taken)
            lock.Leave();
    });
    other.join();
    EXPECT_TRUE(taken);
}

TEST(RecursiveLock, ExcludesOtherThreadsUntilEveryEntryIsLeft) {
    RecursiveLock lock;
    lock.Enter();
    lock.Enter();

    bool takenWhileHeld = true;
    std::thread probe([&] {
        takenWhileHeld = lock.TryEnter();
        if (takenWhileHeld)
            lock.Leave();
    });
    probe.join();
    EXPECT_FALSE(takenWhileHeld);

    lock.Leave();
    bool takenAfterOneLeave = true;
    std::thread secondProbe([&] {
        takenAfterOneLeave = lock.TryEnter();
        if (takenAfterOneLeave)
            lock.Leave();
    });
    secondProbe.join();
    EXPECT_FALSE(takenAfterOneLeave) << "one entry is still held";
    lock.Leave();
}

TEST(RecursiveLock, ProtectsACounterAcrossThreads) {
    constexpr int Rounds = 20000;
    RecursiveLock lock;
    long counter = 0; // deliberately not atomic: the lock alone protects it
    auto work = [&] {
        for (int i = 0; i < Rounds; ++i) {
            std::lock_guard<RecursiveLock> const outer(lock);
            std::lock_guard<RecursiveLock> const inner(lock);
            counter = counter + 1;
        }
    };
    std::thread first(work);
    std::thread second(work);
    first.join();
    second.join();
    EXPECT_EQ(counter, 2L * Rounds);
}
