#pragma once

/// How the points of an edge make lines. The values are the library's interface.
enum TarvexVisuLineType : int {
    TarvexVisuLine_Unknown = 0,
    TarvexVisuLine_Polyline = 1,       ///< the points in order
    TarvexVisuLine_ClosedPolyline = 2, ///< the points in order, and back to the first
    TarvexVisuLine_Segments = 3,       ///< separate segments, one per pair of points
};
