#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIGDT.h>
#include <VizBridge/semantic/VizAnnotationPMILoader.h>

namespace VizBridgeTarvex {

/// A geometrical tolerance: the annotation's keys, then the main line (values, modifiers,
/// datum reference frame) and, for a composite tolerance, the second line under keys that
/// begin with "Composite_". A frame's datums stand as one flat list of their ids, which are
/// the ids of their own records.
class VizGDTSemanticPMILoader : public VizAnnotationPMILoader {
public:
    VizGDTSemanticPMILoader(TarvexPMIGDT& object, SemanticPMI& record)
        : VizAnnotationPMILoader(object, record) {}

protected:
    void LoadSemantics() override;

private:
    void loadMainLine(TarvexPMIGDT const& tolerance);
    void loadCompositeLine(TarvexPMIGDT const& tolerance);
};

} // namespace VizBridgeTarvex
