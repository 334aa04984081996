#include <VizBridge/contracts/kolba/VizCapture.h>

#include <algorithm>
#include <cstddef>

namespace KolbaVizCore {

bool VizCapture::SetOrientation(float const* const position, float const* const target,
                                float const* const up) {
    if (position == nullptr || target == nullptr || up == nullptr)
        return false;
    std::copy(position, position + 3, m_orientation.begin());
    std::copy(target, target + 3, m_orientation.begin() + 3);
    std::copy(up, up + 3, m_orientation.begin() + 6);
    m_hasOrientation = true;
    return true;
}

bool VizCapture::GetOrientation(float* const position, float* const target, float* const up) const {
    if (!m_hasOrientation)
        return false;
    float* const targets[3] = {position, target, up};
    for (std::size_t index = 0; index < 3; ++index)
        if (targets[index] != nullptr)
            std::copy(m_orientation.begin() + 3 * index, m_orientation.begin() + 3 * index + 3,
                      targets[index]);
    return true;
}

VizPort::WString VizCapture::GetCaptureAsString() const {
    VizPort::WString const name = GetName();
    if (name.empty())
        return name;
    return u"Capture : " + name;
}

} // namespace KolbaVizCore
