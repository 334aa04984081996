#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIDimension.h>
#include <VizBridge/semantic/VizAnnotationPMILoader.h>

namespace VizBridgeTarvex {

/// A dimension: the annotation's keys, then its types, position, value with unit and
/// precision, tolerances, texts, substitute values and line. What the dimension does not hold
/// (a getter that answers false) is left out of the record.
class VizDimensionSemanticPMILoader : public VizAnnotationPMILoader {
public:
    VizDimensionSemanticPMILoader(TarvexPMIDimension& object, SemanticPMI& record)
        : VizAnnotationPMILoader(object, record) {}

protected:
    void LoadSemantics() override;

private:
    void loadValue(TarvexPMIDimension const& dimension);
    void loadTexts(TarvexPMIDimension const& dimension);
    void loadLine(TarvexPMIDimension const& dimension);
};

} // namespace VizBridgeTarvex
