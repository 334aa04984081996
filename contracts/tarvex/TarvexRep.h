#pragma once

/// What the multi-process spooler converts a reference to.
enum TarvexRep : int {
    TarvexRep_None = 0,          ///< nothing usable: the conversion failed
    TarvexRep_Visualization = 1, ///< tessellated visualisation data
    TarvexRep_BREP = 2,          ///< the modeler-ready part
};
