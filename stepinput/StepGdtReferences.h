#pragma once

#include <VizBridge/stepinput/StepDocument.h>

#include <TDocStd_Document.hxx>

#include <string>
#include <vector>

namespace VizBridgeStep {

/// Checks the shapes that the file's semantic GD&T (dimensions, geometric tolerances, datums,
/// as Open CASCADE's XCAF reads them) refers to against the parts' face numbering: counts the
/// GD&T objects, their face references and those that resolve to a face id of a part, and
/// notes the rest. The PMI links of the graphical annotations use the same numbering.
class StepGdtReferences {
public:
    static void Check(Handle(TDocStd_Document) const& xcaf, std::vector<StepPart> const& parts,
                      StepCounts& counts, std::vector<std::string>& notes);
};

} // namespace VizBridgeStep
