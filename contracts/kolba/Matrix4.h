#pragma once

#include <array>

namespace KolbaVizCore {

/// A placement of the scene graph: 16 doubles, column-major (OpenGL order), the translation
/// in elements 12 to 14. The last row is kept as given but read as 0, 0, 0, 1: scene
/// placements are affine. A plain value; default: identity.
class Matrix4 {
public:
    Matrix4(); ///< identity
    /// Copies 16 doubles; null gives the identity.
    explicit Matrix4(double const* columnMajor);

    double const* Data() const { return m_values.data(); }
    /// Element of `row` and `column`, both from 0 to 3.
    double At(int row, int column) const {
        return m_values[static_cast<unsigned>(column * 4 + row)];
    }

    bool IsIdentity() const;
    /// this * other: `other` applies first.
    Matrix4 operator*(Matrix4 const& other) const;
    /// The point `in` (3 doubles) placed: matrix times (x, y, z, 1). `out` may be `in`.
    void ApplyToPoint(double const* in, double* out) const;

    bool operator==(Matrix4 const& other) const { return m_values == other.m_values; }

private:
    std::array<double, 16> m_values;
};

} // namespace KolbaVizCore
