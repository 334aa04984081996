#include <VizBridge/contracts/tarvex/TarvexPMICapture.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationIter.h>

#include <algorithm>

namespace {
void copy3(TarvexAuthoredFloat3 const& from, float* const to) {
    if (to) {
        std::copy(from.begin(), from.end(), to);
    }
}
} // namespace

TarvexPMICapture::TarvexPMICapture(TarvexVisuContext context,
                                   std::shared_ptr<TarvexAuthoredPMICapture const> record)
    : TarvexPMIObject(std::move(context), std::move(record)) {}

TarvexAuthoredPMICapture const& TarvexPMICapture::capture(char const* operation) const {
    static TarvexAuthoredPMICapture const empty;
    auto const* record = read<TarvexAuthoredPMICapture>(operation);
    return record ? *record : empty;
}

void TarvexPMICapture::GetAttributes(bool& hidden, bool& current, TarvexWString& hiddenText) const {
    auto const& record = capture("TarvexPMICapture::GetAttributes");
    hidden = record.attributesHidden;
    current = record.current;
    hiddenText = TarvexWString(record.hiddenText);
}

void TarvexPMICapture::GetCamera(TarvexWString& name, TarvexPMICameraType& type,
                                 float* const position, float* const target,
                                 float* const upDirection, float& angle, float& zoom) const {
    auto const& camera = capture("TarvexPMICapture::GetCamera").camera;
    name = TarvexWString(camera.name);
    type = camera.type;
    copy3(camera.position, position);
    copy3(camera.target, target);
    copy3(camera.upDirection, upDirection);
    angle = camera.angle;
    zoom = camera.zoom;
}

bool TarvexPMICapture::GetClippingPlane(float* const origin, float* const normal) const {
    auto const& record = capture("TarvexPMICapture::GetClippingPlane");
    if (!record.clippingPlane) {
        return false;
    }
    copy3(record.clippingPlane->origin, origin);
    copy3(record.clippingPlane->normal, normal);
    return true;
}

TarvexPMIAnnotationIter TarvexPMICapture::GetAnnotationIterator() const {
    auto const& record = capture("TarvexPMICapture::GetAnnotationIterator");
    return TarvexPMIAnnotationIter(context(), share(record.annotations));
}

bool TarvexPMICapture::GetManageHideShowBodyFlag() const {
    return capture("TarvexPMICapture::GetManageHideShowBodyFlag").managesBodies;
}

TarvexEntityIter TarvexPMICapture::GetBodyIterator() const {
    auto const& record = capture("TarvexPMICapture::GetBodyIterator");
    return TarvexEntityIter(context(), share(record.bodies));
}
