#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIDatum.h>
#include <VizBridge/semantic/VizAnnotationPMILoader.h>

namespace VizBridgeTarvex {

/// A datum: the annotation's keys and the datum's label as the record's `Label`. Its targets
/// go on their own records.
class VizDatumSemanticPMILoader : public VizAnnotationPMILoader {
public:
    VizDatumSemanticPMILoader(TarvexPMIDatum& object, SemanticPMI& record)
        : VizAnnotationPMILoader(object, record) {}

protected:
    void LoadSemantics() override;
};

} // namespace VizBridgeTarvex
