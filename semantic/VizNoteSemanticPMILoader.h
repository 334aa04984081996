#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMINote.h>
#include <VizBridge/semantic/VizAnnotationPMILoader.h>

namespace VizBridgeTarvex {

/// A note, flag note or NOA: the annotation's keys, then the text as the record's `Label`
/// with its font and colour, and "Flag Note". Of several texts the last one stays.
class VizNoteSemanticPMILoader : public VizAnnotationPMILoader {
public:
    VizNoteSemanticPMILoader(TarvexPMINote& object, SemanticPMI& record)
        : VizAnnotationPMILoader(object, record) {}

protected:
    void LoadSemantics() override;
};

} // namespace VizBridgeTarvex
