#include <VizBridge/semantic/VizViewSemanticPMILoader.h>

#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void VizViewSemanticPMILoader::LoadSemantics() {
    float origin[3] = {0, 0, 0};
    float uDirection[3] = {0, 0, 0};
    float vDirection[3] = {0, 0, 0};
    if (!object<TarvexPMIAnnotationView>().GetAxis(origin, uDirection, vDirection)) {
        return;
    }
    write(u"Plane_Origin", FormatFloats(3, origin));
    write(u"Plane_UDir", FormatFloats(3, uDirection));
    write(u"Plane_VDir", FormatFloats(3, vDirection));
}

} // namespace VizBridgeTarvex
