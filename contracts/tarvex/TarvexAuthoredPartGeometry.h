#pragma once

#include <vector>

/// A tessellated face of a part: vertex positions (x, y, z per vertex) and triangles as
/// vertex indices, three per triangle. `entityId` names it among the part's faces and edges.
struct TarvexAuthoredFace {
    unsigned int entityId = 0;
    std::vector<float> vertices;
    std::vector<unsigned int> triangles;
};

/// An edge of a part as a polyline (x, y, z per point).
struct TarvexAuthoredEdge {
    unsigned int entityId = 0;
    std::vector<float> points;
};

/// The geometry of a part document, and what converting it costs.
struct TarvexAuthoredPartGeometry {
    std::vector<TarvexAuthoredFace> faces;
    std::vector<TarvexAuthoredEdge> edges;
    /// Processor time, in microseconds, that converting this part spends on top of the work
    /// the conversion really does; lets tests and benchmarks model heavy parts.
    unsigned int conversionCostMicroseconds = 0;
    /// A conversion that fails: the spooler delivers the reference as TarvexRep_None and
    /// TarvexPartDocument::GetConvertedPart gives null.
    bool conversionFails = false;
};
