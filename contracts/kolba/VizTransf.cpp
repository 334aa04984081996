#include <VizBridge/contracts/kolba/VizTransf.h>

#include <algorithm>

namespace KolbaVizCore {

VizTransf::VizTransf() : VizTransf(1.0) {}

VizTransf::VizTransf(double const& scale)
    : m_matrix{{scale, 0.0, 0.0}, {0.0, scale, 0.0}, {0.0, 0.0, scale}}, m_translation{0.0, 0.0,
                                                                                       0.0} {}

// A missing rotation stands for the identity, a missing translation for none.
VizTransf::VizTransf(double const (*rotation)[3], double const* translation) : VizTransf() {
    if (rotation != nullptr) {
        for (int row = 0; row < 3; ++row)
            std::copy(rotation[row], rotation[row] + 3, m_matrix[row]);
    }
    if (translation != nullptr)
        std::copy(translation, translation + 3, m_translation);
}

void VizTransf::AsArray(double* out) const {
    if (out == nullptr)
        return;
    for (int column = 0; column < 3; ++column) {
        for (int row = 0; row < 3; ++row)
            out[column * 4 + row] = m_matrix[row][column];
        out[column * 4 + 3] = 0.0;
    }
    for (int row = 0; row < 3; ++row)
        out[12 + row] = m_translation[row];
    out[15] = 1.0;
}

bool VizTransf::IsIdentity() const {
    return *this == VizTransf();
}

VizTransf VizTransf::operator*(VizTransf const& other) const {
    VizTransf result;
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) {
            double sum = 0.0;
            for (int k = 0; k < 3; ++k)
                sum += m_matrix[row][k] * other.m_matrix[k][column];
            result.m_matrix[row][column] = sum;
        }
    }
    // The other's translation goes through this matrix before this translation is added.
    Apply(other.m_translation, result.m_translation);
    return result;
}

void VizTransf::Apply(double const* point, double* out) const {
    if (point == nullptr || out == nullptr)
        return;
    // Computed aside first: `out` may be `point`.
    double mapped[3];
    for (int row = 0; row < 3; ++row) {
        mapped[row] = m_translation[row];
        for (int k = 0; k < 3; ++k)
            mapped[row] += m_matrix[row][k] * point[k];
    }
    std::copy(mapped, mapped + 3, out);
}

bool VizTransf::operator==(VizTransf const& other) const {
    for (int row = 0; row < 3; ++row) {
        if (!std::equal(m_matrix[row], m_matrix[row] + 3, other.m_matrix[row]))
            return false;
    }
    return std::equal(m_translation, m_translation + 3, other.m_translation);
}

} // namespace KolbaVizCore
