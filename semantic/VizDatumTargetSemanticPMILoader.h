#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIDatumTarget.h>
#include <VizBridge/semantic/VizAnnotationPMILoader.h>

namespace VizBridgeTarvex {

/// A datum target: the annotation's keys, the label as the record's `Label`, and six keys of
/// the target, each with the prefix in front: empty for a target visited by itself, "_0",
/// "_1" and so on for a target visited through its datum.
class VizDatumTargetSemanticPMILoader : public VizAnnotationPMILoader {
public:
    VizDatumTargetSemanticPMILoader(TarvexPMIDatumTarget& object, SemanticPMI& record,
                                    WString prefix)
        : VizAnnotationPMILoader(object, record), m_prefix(std::move(prefix)) {}

protected:
    void LoadSemantics() override;

    WString m_prefix;
};

} // namespace VizBridgeTarvex
