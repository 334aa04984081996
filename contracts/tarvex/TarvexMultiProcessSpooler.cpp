#include <VizBridge/contracts/tarvex/TarvexMultiProcessSpooler.h>

#include <VizBridge/contracts/tarvex/TarvexModelData.h>
#include <VizBridge/contracts/tarvex/TarvexSpoolerState.h>

namespace {

/// Asks the plan of the spooler's model, if it has one, before `operation` answers.
void check(TarvexSpoolerState const& state, char const* operation) {
    if (TarvexModelData const* const data = state.Data()) {
        data->faults.Check(operation, 0);
    }
}

} // namespace

TarvexMultiProcessSpooler::TarvexMultiProcessSpooler(TarvexInputProductStructure const& input)
    : m_state(std::make_unique<TarvexSpoolerState>(input.m_data)) {
    check(*m_state, "TarvexMultiProcessSpooler::TarvexMultiProcessSpooler");
}

TarvexMultiProcessSpooler::~TarvexMultiProcessSpooler() = default;

bool TarvexMultiProcessSpooler::InitiateConversion(TarvexRep representation) {
    check(*m_state, "TarvexMultiProcessSpooler::InitiateConversion");
    // The modeler-ready part is the only form this library converts to ahead of time; asking
    // for another starts nothing, rather than delivering parts in a form nobody asked for.
    if (representation != TarvexRep_BREP) {
        return false;
    }
    return m_state->Start();
}

bool TarvexMultiProcessSpooler::IsComplete() const {
    check(*m_state, "TarvexMultiProcessSpooler::IsComplete");
    return m_state->IsComplete();
}

bool TarvexMultiProcessSpooler::HasDataAvailableFor(unsigned int& id) const {
    check(*m_state, "TarvexMultiProcessSpooler::HasDataAvailableFor");
    return m_state->Deliver(id);
}

TarvexRep TarvexMultiProcessSpooler::GetActiveRepresentation() const {
    check(*m_state, "TarvexMultiProcessSpooler::GetActiveRepresentation");
    return m_state->GetActiveRepresentation();
}
