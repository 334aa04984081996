#include <VizBridge/contracts/tarvex/TarvexPMILeader.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>

int TarvexPMILeader::GetPointCount() const {
    auto const* record = m_context.Read(m_record, "TarvexPMILeader::GetPointCount");
    return record ? static_cast<int>(record->points.size()) : 0;
}

void TarvexPMILeader::GetPoint(int index, float& first, float& second) const {
    auto const* record = m_context.Read(m_record, "TarvexPMILeader::GetPoint");
    if (!record || index < 0 || index >= static_cast<int>(record->points.size())) {
        return;
    }
    first = record->points[static_cast<std::size_t>(index)][0];
    second = record->points[static_cast<std::size_t>(index)][1];
}
