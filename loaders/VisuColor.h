#pragma once

#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdge.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFace.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPoints.h>
#include <VizBridge/contracts/tarvex/TarvexVisuText.h>

#include <vector>

namespace VizBridgeTarvex {

/// The colour an element of `source` should carry. Colour and alpha are looked for
/// independently: each first on the source, then, when `inherit` is true and `attributes` is
/// not null, on the stack from its newest entry to its oldest. Whatever is not found keeps the
/// bytes of a default RGBAColor. Answers whether colour or alpha was found; only then is
/// `color` written. Each 16-bit channel enters by its low 8 bits.
bool resolveVisuColor(TarvexVisuEdge const& source, std::vector<TarvexVisuAttributes>* attributes,
                      KolbaVizCore::RGBAColor& color, bool inherit);
bool resolveVisuColor(TarvexVisuFace const& source, std::vector<TarvexVisuAttributes>* attributes,
                      KolbaVizCore::RGBAColor& color, bool inherit);
bool resolveVisuColor(TarvexVisuPoints const& source, std::vector<TarvexVisuAttributes>* attributes,
                      KolbaVizCore::RGBAColor& color, bool inherit);
bool resolveVisuColor(TarvexVisuText const& source, std::vector<TarvexVisuAttributes>* attributes,
                      KolbaVizCore::RGBAColor& color, bool inherit);

} // namespace VizBridgeTarvex
