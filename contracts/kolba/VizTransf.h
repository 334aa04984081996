#pragma once

namespace KolbaVizCore {

/// An affine transformation: a 3 by 3 matrix and a translation. A point p maps to
/// M * p + t, with M given by rows.
class VizTransf {
public:
    VizTransf(); ///< identity
    explicit VizTransf(double const& scale);
    VizTransf(double const (*rotation)[3], double const* translation);

    /// Writes 16 doubles, column-major (OpenGL order): the matrix in the upper left,
    /// the translation in elements 12, 13 and 14, and 0, 0, 0, 1 in the last row.
    void AsArray(double* out) const;

    bool IsIdentity() const;
    /// this * other: apply `other` first, then this.
    VizTransf operator*(VizTransf const& other) const;
    void Apply(double const* point, double* out) const;

    double const (&GetMatrix() const)[3][3] { return m_matrix; }
    double const* GetTranslation() const { return m_translation; }

    bool operator==(VizTransf const& other) const;

private:
    double m_matrix[3][3];
    double m_translation[3];
};

} // namespace KolbaVizCore
