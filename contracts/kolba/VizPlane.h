#pragma once

#include <array>

namespace KolbaVizCore {

/// A plane as three triples of floats, kept as given: a point, then two directions. Knows
/// the outline that a view or capture draws for it. A plain value; starts unset.
class VizPlane {
public:
    /// Copies three floats from each array. False, and the plane as it was, if any is null.
    bool Set(float const* const origin, float const* const firstDirection,
             float const* const secondDirection);
    bool IsSet() const { return m_isSet; }
    /// False, and the arrays untouched, while the plane is unset; each null array is skipped.
    bool Get(float* const origin, float* const firstDirection, float* const secondDirection) const;

    /// The parallelogram spanned by the two directions from the point, as a closed line of
    /// five points (15 floats): the point, point + first, point + first + second,
    /// point + second, the point again. Null while the plane is unset.
    float const* GetRectangle() const { return m_isSet ? m_rectangle.data() : nullptr; }

private:
    bool m_isSet = false;
    std::array<float, 9> m_frame{};
    std::array<float, 15> m_rectangle{};
};

} // namespace KolbaVizCore
