#include <VizBridge/contracts/tarvex/TarvexVisuView.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIDIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using View = TarvexAuthoredVisuView;

bool TarvexVisuView::GetHidden(bool& hidden) const {
    View const* const view = m_context.Read(m_record, "TarvexVisuView::GetHidden");
    return TarvexVisuValues::Flag(TarvexVisuValues::Member(view, &View::hidden), hidden);
}

TarvexWString TarvexVisuView::GetDisplayName() const {
    View const* const view = m_context.Read(m_record, "TarvexVisuView::GetDisplayName");
    return TarvexVisuValues::TextOrNone(TarvexVisuValues::Member(view, &View::displayName));
}

bool TarvexVisuView::GetID(TarvexWString& id) const {
    View const* const view = m_context.Read(m_record, "TarvexVisuView::GetID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(view, &View::id), id);
}

bool TarvexVisuView::GetMechanicalID(TarvexWString& id) const {
    View const* const view = m_context.Read(m_record, "TarvexVisuView::GetMechanicalID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(view, &View::mechanicalId), id);
}

bool TarvexVisuView::GetViewAxis(float* const origin, float* const first,
                                 float* const second) const {
    View const* const view = m_context.Read(m_record, "TarvexVisuView::GetViewAxis");
    return TarvexVisuValues::ThreeTriples(TarvexVisuValues::Member(view, &View::axis), origin,
                                          first, second);
}

TarvexVisuIDIter TarvexVisuView::GetAnnotationIDIterator() const {
    View const* const view = m_context.Read(m_record, "TarvexVisuView::GetAnnotationIDIterator");
    if (view == nullptr) {
        return TarvexVisuIDIter();
    }
    return TarvexVisuIDIter(m_context, {m_record, &view->annotationIds});
}
