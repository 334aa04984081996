#include <VizBridge/contracts/kolba/VizBox.h>

#include <algorithm>
#include <cmath>
#include <limits>

namespace KolbaVizCore {

namespace {
constexpr double Infinity = std::numeric_limits<double>::infinity();
} // namespace

// Low at +infinity and high at -infinity: the first point added becomes the whole box.
VizBox::VizBox() : m_low{Infinity, Infinity, Infinity}, m_high{-Infinity, -Infinity, -Infinity} {}

VizBox::VizBox(double const* low, double const* high) : VizBox() {
    if (low == nullptr || high == nullptr)
        return;
    std::copy(low, low + 3, m_low);
    std::copy(high, high + 3, m_high);
}

bool VizBox::IsEmpty() const {
    for (int axis = 0; axis < 3; ++axis) {
        if (m_low[axis] > m_high[axis])
            return true;
    }
    return false;
}

void VizBox::Add(VizBox const& other) {
    if (other.IsEmpty())
        return;
    if (IsEmpty()) {
        // A box that is empty on one axis only must not lend its other axes to the sum.
        *this = other;
        return;
    }
    for (int axis = 0; axis < 3; ++axis) {
        m_low[axis] = std::min(m_low[axis], other.m_low[axis]);
        m_high[axis] = std::max(m_high[axis], other.m_high[axis]);
    }
}

void VizBox::Add(double const* point) {
    if (point == nullptr)
        return;
    Add(VizBox(point, point));
}

void VizBox::GetCenter(double* center) const {
    if (center == nullptr)
        return;
    bool const empty = IsEmpty();
    for (int axis = 0; axis < 3; ++axis) {
        // Halved before adding, so that boxes near the largest double do not overflow.
        center[axis] = empty ? 0.0 : m_low[axis] / 2.0 + m_high[axis] / 2.0;
    }
}

void VizBox::Scale(double const& factor) {
    if (IsEmpty())
        return;
    // About the origin, as a uniform scale transformation moves the points inside the box;
    // a negative factor mirrors, so the corners may swap.
    for (int axis = 0; axis < 3; ++axis) {
        double const a = m_low[axis] * factor;
        double const b = m_high[axis] * factor;
        m_low[axis] = std::min(a, b);
        m_high[axis] = std::max(a, b);
    }
}

bool VizBox::operator==(VizBox const& other) const {
    bool const empty = IsEmpty();
    if (empty || other.IsEmpty())
        return empty == other.IsEmpty();
    return std::equal(m_low, m_low + 3, other.m_low) &&
           std::equal(m_high, m_high + 3, other.m_high);
}

} // namespace KolbaVizCore
