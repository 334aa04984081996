#include <VizBridge/semantic/VizDatumTargetSemanticPMILoader.h>

#include <VizBridge/semantic/PMIVocabulary.h>
#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void VizDatumTargetSemanticPMILoader::LoadSemantics() {
    VizAnnotationPMILoader::LoadSemantics();
    auto const& target = object<TarvexPMIDatumTarget>();
    m_record->Label = ToWString(target.GetLabel());

    TarvexPMIDatumTargetType type = TarvexPMI_DTT_Unknown;
    bool hasDiameter = false;
    TarvexWString upper(u"");
    TarvexWString lower(u"");
    float position1[3] = {0, 0, 0};
    float position2[3] = {0, 0, 0};
    target.GetInfo(type, hasDiameter, upper, lower, position1, position2);

    write(m_prefix + u"Target Type", DatumTargetTypeToText(type));
    write(m_prefix + u"Upper", ToWString(upper));
    write(m_prefix + u"Lower", ToWString(lower));
    write(m_prefix + u"Position 1", FormatFloats(3, position1));
    write(m_prefix + u"Position 2", FormatFloats(3, position2));
    write(m_prefix + u"Has_Diameter", FormatBool(hasDiameter));
}

} // namespace VizBridgeTarvex
