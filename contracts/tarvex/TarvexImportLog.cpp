#include <VizBridge/contracts/tarvex/TarvexImportLog.h>

void TarvexImportLog::Add(TarvexImportCall call) {
    std::lock_guard<std::mutex> const lock(m_mutex);
    m_calls.push_back(std::move(call));
}

std::vector<TarvexImportCall> TarvexImportLog::Get() const {
    std::lock_guard<std::mutex> const lock(m_mutex);
    return m_calls;
}
