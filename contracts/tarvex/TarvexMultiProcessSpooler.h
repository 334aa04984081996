#pragma once

#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexRep.h>

#include <memory>

class TarvexSpoolerState;

/// Converts the part references of an input product structure ahead of time on worker
/// threads, and hands them over one by one, each unique part once, in the order in which
/// their conversions finish (or in the delivery order the model prescribes).
///
/// Only the thread that made the spooler calls it; the workers touch nothing but the
/// conversions. Destroying the spooler stops and joins the workers.
class TarvexMultiProcessSpooler {
public:
    explicit TarvexMultiProcessSpooler(TarvexInputProductStructure const& input);
    ~TarvexMultiProcessSpooler();
    TarvexMultiProcessSpooler(TarvexMultiProcessSpooler const&) = delete;
    TarvexMultiProcessSpooler& operator=(TarvexMultiProcessSpooler const&) = delete;

    /// Starts converting every unique part reference to `representation` on
    /// min(processors to use, parts) workers. Answers false if a conversion already runs.
    /// A spooler converts once: a second call answers false, also after the first finished.
    /// Only TarvexRep_BREP is converted ahead of time; any other representation answers false
    /// and starts nothing, so the spooler stays complete.
    bool InitiateConversion(TarvexRep representation);
    /// True once every reference has been delivered (and at once if nothing was started).
    bool IsComplete() const;
    /// True and `id` set to the next converted reference, if one is ready; `id` is left alone
    /// otherwise. Never waits for a conversion.
    bool HasDataAvailableFor(unsigned int& id) const;
    /// The representation of the reference delivered last: TarvexRep_None if its conversion
    /// failed.
    TarvexRep GetActiveRepresentation() const;

private:
    std::unique_ptr<TarvexSpoolerState> m_state;
};
