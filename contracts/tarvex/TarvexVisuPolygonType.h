#pragma once

/// How the indices of a polygon make triangles. The values are the library's interface.
enum TarvexVisuPolygonType : int {
    TarvexVisuPolygon_Unknown = 0,
    TarvexVisuPolygon_Triangles = 1,     ///< every three indices make one triangle
    TarvexVisuPolygon_TriangleStrip = 2, ///< each index after the second closes a triangle
                                         ///< with the two before it
    TarvexVisuPolygon_TriangleFan = 3,   ///< each index after the second closes a triangle
                                         ///< with its predecessor and the first index
};
