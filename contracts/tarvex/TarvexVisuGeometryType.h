#pragma once

/// What a mesh, wire or point set of the visualisation data stands for. The values are the
/// library's interface.
enum TarvexVisuGeometryType : int {
    TarvexVisuGeometry_Unknown = 0,
    TarvexVisuGeometry_Standard = 1,       ///< the geometry of the part itself
    TarvexVisuGeometry_Constructed = 2,    ///< constructed geometry
    TarvexVisuGeometry_FTAConstructed = 3, ///< constructed geometry that belongs to the PMI
};
