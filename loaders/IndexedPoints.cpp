#include <VizBridge/loaders/IndexedPoints.h>

namespace VizBridgeTarvex {

bool appendIndexedPoints(float const* const points, int const pointFloats, int const* const indices,
                         int const count, std::vector<float>& out) {
    for (int i = 0; i < count; ++i) {
        int const first = indices[i];
        if (points == nullptr || first < 0 || first > pointFloats - 3)
            return false;
        out.insert(out.end(), points + first, points + first + 3);
    }
    return true;
}

} // namespace VizBridgeTarvex
