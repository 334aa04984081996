#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIDatum.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <memory>

class TarvexPMIDatumRefModifiedDatumIter;
struct TarvexAuthoredPMIDatumRef;

/// One datum reference of a frame: the datums it is made of (one, or several for a common
/// datum such as A-B), each with the material condition it is taken at.
class TarvexPMIDatumRef {
public:
    /// A datum as the reference uses it, handed out by value.
    struct ModifiedDatum {
        TarvexPMIDatum datum;
        TarvexPMIToleranceModifier modifier = TarvexPMI_NoModifier;
    };

    TarvexPMIDatumRef() = default;
    TarvexPMIDatumRef(TarvexVisuContext context,
                      std::shared_ptr<TarvexAuthoredPMIDatumRef const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    TarvexPMIDatumRefModifiedDatumIter GetModifiedDatumIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredPMIDatumRef const> m_record; ///< shares its tolerance's record
};
