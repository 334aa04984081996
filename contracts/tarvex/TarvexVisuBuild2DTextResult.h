#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFaceIter.h>

#include <memory>
#include <vector>

/// The geometry of a laid-out text: one stroke per glyph contour, and one filled face per
/// glyph. Shares the geometry with the edges and faces it hands out. A default object holds
/// none.
class TarvexVisuBuild2DTextResult {
public:
    TarvexVisuBuild2DTextResult() = default;
    TarvexVisuBuild2DTextResult(TarvexVisuContext context,
                                std::shared_ptr<std::vector<TarvexAuthoredVisuEdge> const> strokes,
                                std::shared_ptr<std::vector<TarvexAuthoredVisuFace> const> faces)
        : m_context(std::move(context)), m_strokes(std::move(strokes)), m_faces(std::move(faces)) {}

    /// The glyph outlines as closed polylines.
    TarvexVisuEdgeIter GetStrokedFontTextIterator() const;
    /// The filled glyphs, as faces of triangles.
    TarvexVisuFaceIter GetFilledFontTextIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<std::vector<TarvexAuthoredVisuEdge> const> m_strokes;
    std::shared_ptr<std::vector<TarvexAuthoredVisuFace> const> m_faces;
};
