#pragma once

namespace KolbaVizCore {
class ARenderer;
}

namespace VizBridgeTarvex {

/// A renderer with a placement: a plain record offered to hosts that place one renderer's
/// drawing several times; nothing in VizBridge uses it. Points at the renderer without owning
/// it; copies copy everything.
/// Matrix elements below 1e-10 (negative ones included) are stored as 0.
struct ReferenceRenderer {
    /// `matrix` is 16 doubles, row by row.
    ReferenceRenderer(KolbaVizCore::ARenderer* renderer, double* const matrix);
    /// A rotation (3 by 3, rows) and a translation array: column 3 of rows 0 to 2 takes its
    /// elements 0, 2 and 3, so the array needs at least four elements; element 1 is unused.
    ReferenceRenderer(KolbaVizCore::ARenderer* renderer, double (*const rotation)[3],
                      double* const translation);

    KolbaVizCore::ARenderer* renderer; ///< not owned
    double matrix[16];
};

} // namespace VizBridgeTarvex
