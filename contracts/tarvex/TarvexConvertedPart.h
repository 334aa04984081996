#pragma once

#include <vector>

/// A part document in modeler-ready form: triangle soup with one normal per triangle,
/// polylines, and the bounding box. Immutable once made.
struct TarvexConvertedPart {
    struct Face {
        unsigned int entityId = 0;
        std::vector<float> positions; ///< x, y, z of 3 corners per triangle
        std::vector<float> normals;   ///< x, y, z per triangle, unit length (0 if degenerate)
    };
    struct Edge {
        unsigned int entityId = 0;
        std::vector<float> points;
    };
    std::vector<Face> faces;
    std::vector<Edge> edges;
    double low[3] = {0, 0, 0};
    double high[3] = {0, 0, 0};
    bool empty = true; ///< no point at all: low and high mean nothing
};
