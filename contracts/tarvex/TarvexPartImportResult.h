#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIData.h>

/// What a part import gives beside the modeler's container. Default-constructed by the
/// caller; the modeler fills it.
class TarvexPartImportResult {
public:
    void SetPMIData(TarvexPMIData const& data) { m_pmiData = data; }
    /// The part's PMI; empty until the modeler set it.
    TarvexPMIData GetPMIData() const;

private:
    TarvexPMIData m_pmiData;
};
