#pragma once

#include "support/TarvexVisuTestModel.h"
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexFault.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPMI.h>

#include <optional>
#include <string>
#include <utility>

namespace LoaderTest {

/// Visualisation data read back through an import of part 20, for what only a model gives:
/// texts the text builder lays out, entities that reach instances, faults that fire.
struct ImportedVisu {
    /// The PMI of a new note node holding `pmi`.
    TarvexVisuPMI PMI(TarvexAuthoredVisuPMI pmi) {
        TarvexAuthoredVisuNode& node = test.Visu().nodes.emplace_back();
        node.type = TarvexVisuNode::VisuNote;
        node.pmi = std::move(pmi);
        return test.Nodes().back().GetPMI();
    }

    /// Plans `operation` to throw once after `skip` calls, a std::exception or a foreign error.
    void FailOnce(std::string operation, int skip, bool foreign = false) {
        test.model.Faults().Add(
            {std::move(operation), std::nullopt,
             foreign ? TarvexFaultKind::NonStdException : TarvexFaultKind::StdException, "planned",
             skip, 1});
    }

    TarvexVisuTestModel test;
};

/// A text record with `text` laid out at the origin along x, facing z.
inline TarvexAuthoredVisuText TextRecord(std::optional<VizPort::WString> text) {
    TarvexAuthoredVisuText record;
    record.text = std::move(text);
    return record;
}

} // namespace LoaderTest
