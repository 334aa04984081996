#include <VizBridge/semantic/VizDatumSemanticPMILoader.h>

#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void VizDatumSemanticPMILoader::LoadSemantics() {
    VizAnnotationPMILoader::LoadSemantics();
    m_record->Label = ToWString(object<TarvexPMIDatum>().GetLabel());
}

} // namespace VizBridgeTarvex
