#include <VizBridge/contracts/kolba/VizEdge.h>

namespace KolbaVizCore {

void VizEdge::RemoveTransparency() {
    RGBAColor color = GetColor();
    color.alpha = 255;
    SetColorState(HasColor(), color);
}

} // namespace KolbaVizCore
