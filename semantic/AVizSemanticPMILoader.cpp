#include <VizBridge/semantic/AVizSemanticPMILoader.h>

#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void AVizSemanticPMILoader::Load() {
    m_record->Name = ToWString(m_object->GetName());
    m_record->ID = ToWString(m_object->GetID());
    write(u"Hidden", FormatBool(m_object->IsHidden()));
    LoadSemantics();
}

} // namespace VizBridgeTarvex
