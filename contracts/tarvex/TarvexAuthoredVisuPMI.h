#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredEntity.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>

#include <array>
#include <optional>
#include <vector>

/// The glyphs of a text as its document already holds them, laid out in the part's
/// coordinates: outlines as closed polylines and filled shapes as faces. CAD files that carry
/// PMI as tessellated presentation give their texts this way, often with no string at all.
struct TarvexAuthoredVisuGlyphs {
    std::vector<TarvexAuthoredVisuEdge> strokes;
    std::vector<TarvexAuthoredVisuFace> faces;
};

/// A text of a PMI: the string, where it stands and how it runs. The direction runs along
/// the text; the normal faces the reader. A text with glyphs is drawn as those glyphs; its
/// string, if any, only names it.
struct TarvexAuthoredVisuText {
    std::optional<VizPort::WString> text;
    std::array<float, 3> anchor = {0, 0, 0};
    std::array<float, 3> direction = {1, 0, 0};
    std::array<float, 3> normal = {0, 0, 1};
    std::optional<TarvexAuthoredVisuFont> font;
    std::optional<std::array<unsigned short, 3>> rgb;
    std::optional<unsigned short> alpha;
    // Initialised here so that texts described member by member may leave it out.
    std::optional<TarvexAuthoredVisuGlyphs> glyphs = std::nullopt;
};

/// A tessellated PMI: its lines, its texts and the entities it points at.
struct TarvexAuthoredVisuPMI {
    std::optional<VizPort::WString> displayName;
    std::optional<VizPort::WString> id;
    std::optional<VizPort::WString> mechanicalId;
    std::vector<TarvexAuthoredVisuEdge> edges;
    std::vector<TarvexAuthoredVisuText> texts;
    std::vector<TarvexAuthoredEntity> linkedElements;
};
