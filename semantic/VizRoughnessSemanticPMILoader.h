#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIRoughness.h>
#include <VizBridge/semantic/VizAnnotationPMILoader.h>

namespace VizBridgeTarvex {

/// A roughness symbol: the annotation's keys, how the surface is obtained, where the symbol
/// applies, "Count", and each text field under "0_Rough", "1_Rough" and so on. The record
/// orders "10_Rough" before "2_Rough": a reader wanting index order forms the keys from
/// "Count".
class VizRoughnessSemanticPMILoader : public VizAnnotationPMILoader {
public:
    VizRoughnessSemanticPMILoader(TarvexPMIRoughness& object, SemanticPMI& record)
        : VizAnnotationPMILoader(object, record) {}

protected:
    void LoadSemantics() override;
};

} // namespace VizBridgeTarvex
