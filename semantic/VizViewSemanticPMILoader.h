#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationView.h>
#include <VizBridge/semantic/AVizSemanticPMILoader.h>

namespace VizBridgeTarvex {

/// An annotation view: the plane, when the view has one. A view is no annotation, so its
/// record has neither placement nor "Leader".
class VizViewSemanticPMILoader : public AVizSemanticPMILoader {
public:
    VizViewSemanticPMILoader(TarvexPMIAnnotationView& object, SemanticPMI& record)
        : AVizSemanticPMILoader(object, record) {}

protected:
    void LoadSemantics() override;
};

} // namespace VizBridgeTarvex
