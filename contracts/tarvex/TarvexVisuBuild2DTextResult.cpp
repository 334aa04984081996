#include <VizBridge/contracts/tarvex/TarvexVisuBuild2DTextResult.h>

TarvexVisuEdgeIter TarvexVisuBuild2DTextResult::GetStrokedFontTextIterator() const {
    m_context.Check("TarvexVisuBuild2DTextResult::GetStrokedFontTextIterator");
    return TarvexVisuEdgeIter(m_context, m_strokes);
}

TarvexVisuFaceIter TarvexVisuBuild2DTextResult::GetFilledFontTextIterator() const {
    m_context.Check("TarvexVisuBuild2DTextResult::GetFilledFontTextIterator");
    return TarvexVisuFaceIter(m_context, m_faces);
}
