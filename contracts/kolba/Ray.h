#pragma once

namespace KolbaVizCore {

/// A half line from `origin` along `direction` (not necessarily of unit length).
struct Ray {
    double origin[3] = {0.0, 0.0, 0.0};
    double direction[3] = {0.0, 0.0, 1.0};
};

} // namespace KolbaVizCore
