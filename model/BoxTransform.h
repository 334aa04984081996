#pragma once

#include <VizBridge/model/VizTypes.h>

namespace VizBridgeTarvex {

/// The box around the eight corners of `box` moved by `transformation`: a rotation moves the
/// corners off the axes, so the moved box is the one around all of them. An empty box stays
/// empty.
VizBox TransformBox(VizTransf const& transformation, VizBox const& box);

} // namespace VizBridgeTarvex
