#include <VizBridge/contracts/tarvex/TarvexVisuCapture.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCamera.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIDIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Capture = TarvexAuthoredVisuCapture;

bool TarvexVisuCapture::GetHidden(bool& hidden) const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetHidden");
    return TarvexVisuValues::Flag(TarvexVisuValues::Member(capture, &Capture::hidden), hidden);
}

bool TarvexVisuCapture::GetActive(bool& active) const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetActive");
    return TarvexVisuValues::Flag(TarvexVisuValues::Member(capture, &Capture::active), active);
}

TarvexVisuCamera TarvexVisuCapture::GetCamera() const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetCamera");
    if (capture == nullptr) {
        return TarvexVisuCamera();
    }
    return TarvexVisuCamera(m_context, {m_record, &capture->camera});
}

TarvexWString TarvexVisuCapture::GetDisplayName() const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetDisplayName");
    return TarvexVisuValues::TextOrNone(TarvexVisuValues::Member(capture, &Capture::displayName));
}

bool TarvexVisuCapture::GetID(TarvexWString& id) const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(capture, &Capture::id), id);
}

bool TarvexVisuCapture::GetMechanicalID(TarvexWString& id) const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetMechanicalID");
    return TarvexVisuValues::Text(TarvexVisuValues::Member(capture, &Capture::mechanicalId), id);
}

TarvexWString TarvexVisuCapture::GetHiddenText() const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetHiddenText");
    return TarvexVisuValues::TextOrNone(TarvexVisuValues::Member(capture, &Capture::hiddenText));
}

bool TarvexVisuCapture::GetClippingPlane(float* const origin, float* const normal,
                                         float* const first) const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetClippingPlane");
    return TarvexVisuValues::ThreeTriples(
        TarvexVisuValues::Member(capture, &Capture::clippingPlane), origin, normal, first);
}

TarvexVisuIDIter TarvexVisuCapture::GetAnnotationIDIterator() const {
    Capture const* const capture =
        m_context.Read(m_record, "TarvexVisuCapture::GetAnnotationIDIterator");
    if (capture == nullptr) {
        return TarvexVisuIDIter();
    }
    return TarvexVisuIDIter(m_context, {m_record, &capture->annotationIds});
}

TarvexVisuIDIter TarvexVisuCapture::GetFTACGIDIterator() const {
    Capture const* const capture =
        m_context.Read(m_record, "TarvexVisuCapture::GetFTACGIDIterator");
    if (capture == nullptr) {
        return TarvexVisuIDIter();
    }
    return TarvexVisuIDIter(m_context, {m_record, &capture->ftaConstructedGeometryIds});
}

bool TarvexVisuCapture::GetManagesGeometry() const {
    Capture const* const capture =
        m_context.Read(m_record, "TarvexVisuCapture::GetManagesGeometry");
    return capture != nullptr && capture->managesGeometry;
}

TarvexEntityIter TarvexVisuCapture::GetBodyIDIterator() const {
    Capture const* const capture = m_context.Read(m_record, "TarvexVisuCapture::GetBodyIDIterator");
    if (capture == nullptr) {
        return TarvexEntityIter();
    }
    return TarvexEntityIter(m_context, {m_record, &capture->bodies});
}
