#pragma once

#include <optional>

/// Process-wide settings of the multi-process conversion.
class TarvexMultiProcess {
public:
    /// How many processes a conversion may use; 0 stands for all physical processors.
    /// Default 0. A count below 0 is taken as 0.
    static int GetNumberOfProcessorsToUse();
    static void SetNumberOfProcessorsToUse(int count);

    /// The machine's processor count (std::thread::hardware_concurrency, at least 1), unless
    /// an override is set. An override below 1 is taken as 1; std::nullopt removes it.
    static int GetNumberOfPhysicalProcessors();
    static void SetPhysicalProcessorsOverride(std::optional<int> count);
};

/// Sets both settings for one scope and restores them afterwards.
class TarvexScopedProcessors {
public:
    TarvexScopedProcessors(int toUse, std::optional<int> physical);
    ~TarvexScopedProcessors();
    TarvexScopedProcessors(TarvexScopedProcessors const&) = delete;
    TarvexScopedProcessors& operator=(TarvexScopedProcessors const&) = delete;

private:
    // The settings as they were before this scope, put back by the destructor.
    int m_toUse;
    std::optional<int> m_physical;
};
