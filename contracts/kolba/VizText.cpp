#include <VizBridge/contracts/kolba/VizText.h>

#include <algorithm>

namespace KolbaVizCore {

namespace {

void copyThree(float const* from, float* to) {
    if (from != nullptr)
        std::copy(from, from + 3, to);
}

} // namespace

void VizText::SetAnchorPoint(float const* const point) {
    copyThree(point, m_anchor);
}

void VizText::SetDirection(float const* const direction) {
    copyThree(direction, m_direction);
}

void VizText::SetNormal(float const* const normal) {
    copyThree(normal, m_normal);
}

void VizText::RemoveTransparency() {
    RGBAColor color = GetColor();
    color.alpha = 255;
    SetColorState(HasColor(), color);
}

} // namespace KolbaVizCore
