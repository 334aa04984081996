#include <VizBridge/contracts/kolba/Matrix4.h>

#include <algorithm>

namespace KolbaVizCore {

Matrix4::Matrix4() : m_values{1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1} {}

Matrix4::Matrix4(double const* columnMajor) : Matrix4() {
    if (columnMajor != nullptr)
        std::copy(columnMajor, columnMajor + 16, m_values.begin());
}

bool Matrix4::IsIdentity() const {
    return *this == Matrix4();
}

Matrix4 Matrix4::operator*(Matrix4 const& other) const {
    Matrix4 result;
    for (int column = 0; column < 4; ++column) {
        for (int row = 0; row < 4; ++row) {
            double sum = 0.0;
            for (int k = 0; k < 4; ++k)
                sum += At(row, k) * other.At(k, column);
            result.m_values[static_cast<unsigned>(column * 4 + row)] = sum;
        }
    }
    return result;
}

void Matrix4::ApplyToPoint(double const* in, double* out) const {
    // Computed aside first: `out` may be `in`.
    double placed[3];
    for (int row = 0; row < 3; ++row)
        placed[row] = At(row, 0) * in[0] + At(row, 1) * in[1] + At(row, 2) * in[2] + At(row, 3);
    std::copy(placed, placed + 3, out);
}

} // namespace KolbaVizCore
