#pragma once

#include <VizBridge/model/VizTypes.h>

namespace VizBridgeTarvex {

/// What was drawn for one reference: the path of the drawn subtree, and its box in the
/// reference's own coordinates. Further instances of the reference reuse both.
struct RenderedGeometry {
    RenderId path;
    VizBox box;
};

} // namespace VizBridgeTarvex
