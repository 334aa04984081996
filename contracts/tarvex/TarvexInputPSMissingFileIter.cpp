#include <VizBridge/contracts/tarvex/TarvexInputPSMissingFileIter.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>

int TarvexInputPSMissingFileIter::GetCount() const {
    if (!m_data) {
        return 0;
    }
    m_data->faults.Check("TarvexInputPSMissingFileIter::GetCount", 0);
    return static_cast<int>(m_data->missingFiles.size());
}

bool TarvexInputPSMissingFileIter::Next() {
    if (!m_data) {
        return false;
    }
    m_data->faults.Check("TarvexInputPSMissingFileIter::Next", 0);
    int const count = static_cast<int>(m_data->missingFiles.size());
    // Stops one past the last item, so that further calls keep answering false.
    if (m_position < count) {
        ++m_position;
    }
    return m_position < count;
}

TarvexWString TarvexInputPSMissingFileIter::Current() const {
    if (!m_data) {
        return TarvexWString();
    }
    m_data->faults.Check("TarvexInputPSMissingFileIter::Current", 0);
    if (m_position < 0 || m_position >= static_cast<int>(m_data->missingFiles.size())) {
        return TarvexWString();
    }
    return TarvexWString(m_data->missingFiles[static_cast<std::size_t>(m_position)]);
}
