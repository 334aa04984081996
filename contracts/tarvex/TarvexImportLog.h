#pragma once

#include <VizBridge/contracts/tarvex/TarvexImportCall.h>

#include <mutex>
#include <vector>

/// The importer calls made on one model, in the order they were made, for tests that check
/// which import ran. Internal to the library; thread-safe.
class TarvexImportLog {
public:
    void Add(TarvexImportCall call);
    std::vector<TarvexImportCall> Get() const;

private:
    mutable std::mutex m_mutex;
    std::vector<TarvexImportCall> m_calls;
};
