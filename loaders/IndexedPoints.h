#pragma once

#include <vector>

namespace VizBridgeTarvex {

/// Resolves an index array of the import data into a flat vertex list. An index is the offset
/// of a point's first float in `points`, not the number of the point, so each index k appends
/// the floats k, k + 1 and k + 2. Answers false, leaving `out` in an unspecified state, when
/// an index does not name three floats of the `pointFloats` that `points` holds: such an
/// array cannot be drawn, and reading past the coordinates must not happen.
bool appendIndexedPoints(float const* points, int pointFloats, int const* indices, int count,
                         std::vector<float>& out);

} // namespace VizBridgeTarvex
