#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

class TarvexPMIDatumRefIter;
struct TarvexAuthoredPMIRefFrame;

/// The datum reference frame of a geometrical tolerance: its label and its datum references
/// in order. A default frame has no label and no references.
class TarvexPMIGDTRefFrame {
public:
    TarvexPMIGDTRefFrame() = default;
    TarvexPMIGDTRefFrame(TarvexVisuContext context,
                         std::shared_ptr<TarvexAuthoredPMIRefFrame const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    TarvexWString GetLabel() const;
    TarvexPMIDatumRefIter GetDatumRefIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredPMIRefFrame const> m_record; ///< shares its tolerance's record
};
