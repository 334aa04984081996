#pragma once

namespace KolbaVizCore {

/// How the indices of a polygon make triangles. `UndefinedTriangles` draws nothing.
enum TriangleType {
    UndefinedTriangles = 0,
    Triangles = 1,     ///< every three indices make one triangle
    TriangleStrip = 2, ///< each index after the second closes a triangle with the two before it
    TriangleFan = 3,   ///< each index after the second closes a triangle with its predecessor
                       ///< and the first index
};

} // namespace KolbaVizCore
