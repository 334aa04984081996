#include <VizBridge/semantic/VizRoughnessSemanticPMILoader.h>

#include <VizBridge/semantic/PMIVocabulary.h>
#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void VizRoughnessSemanticPMILoader::LoadSemantics() {
    VizAnnotationPMILoader::LoadSemantics();
    auto const& roughness = object<TarvexPMIRoughness>();
    TarvexPMIRoughnessObtentionType const obtention = roughness.GetRoughnessObtention();
    TarvexPMIRoughnessApplicabilityType const applicability = roughness.GetRoughnessApplicability();
    int const count = roughness.GetRoughnessFieldCount();
    write(u"ObtentionType", RoughnessObtentionTypeToText(obtention));
    write(u"ApplicabilityType", RoughnessApplicabilityTypeToText(applicability));
    write(u"Count", FormatInt(count));
    for (int index = 0; index < count; ++index) {
        write(FormatInt(index) + u"_Rough", ToWString(roughness.GetRoughnessFieldAt(index)));
    }
}

} // namespace VizBridgeTarvex
