#include <VizBridge/contracts/kolba/VizPlane.h>

#include <algorithm>
#include <cstddef>

namespace KolbaVizCore {

bool VizPlane::Set(float const* const origin, float const* const firstDirection,
                   float const* const secondDirection) {
    if (origin == nullptr || firstDirection == nullptr || secondDirection == nullptr)
        return false;
    std::copy(origin, origin + 3, m_frame.begin());
    std::copy(firstDirection, firstDirection + 3, m_frame.begin() + 3);
    std::copy(secondDirection, secondDirection + 3, m_frame.begin() + 6);
    // Multiples of the two directions, corner by corner, closing at the first corner.
    static constexpr float steps[5][2] = {{0, 0}, {1, 0}, {1, 1}, {0, 1}, {0, 0}};
    for (std::size_t corner = 0; corner < 5; ++corner)
        for (std::size_t axis = 0; axis < 3; ++axis)
            m_rectangle[corner * 3 + axis] = origin[axis] +
                                             steps[corner][0] * firstDirection[axis] +
                                             steps[corner][1] * secondDirection[axis];
    m_isSet = true;
    return true;
}

bool VizPlane::Get(float* const origin, float* const firstDirection,
                   float* const secondDirection) const {
    if (!m_isSet)
        return false;
    float* const targets[3] = {origin, firstDirection, secondDirection};
    for (std::size_t index = 0; index < 3; ++index)
        if (targets[index] != nullptr)
            std::copy(m_frame.begin() + 3 * index, m_frame.begin() + 3 * index + 3, targets[index]);
    return true;
}

} // namespace KolbaVizCore
