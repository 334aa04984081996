#include <VizBridge/contracts/tarvex/TarvexVisuCamera.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexVisuValues.h>

using Camera = TarvexAuthoredVisuCamera;

TarvexVisuCamera::TarvexVisuCameraType TarvexVisuCamera::GetType() const {
    Camera const* const camera = m_context.Read(m_record, "TarvexVisuCamera::GetType");
    return camera == nullptr ? CameraUnknown : camera->type;
}

bool TarvexVisuCamera::GetOrientation(float* const position, float* const target,
                                      float* const up) const {
    Camera const* const camera = m_context.Read(m_record, "TarvexVisuCamera::GetOrientation");
    return TarvexVisuValues::ThreeTriples(TarvexVisuValues::Member(camera, &Camera::orientation),
                                          position, target, up);
}

float TarvexVisuCamera::GetPerspectiveViewAngle() const {
    Camera const* const camera =
        m_context.Read(m_record, "TarvexVisuCamera::GetPerspectiveViewAngle");
    return camera == nullptr ? Camera().perspectiveViewAngle : camera->perspectiveViewAngle;
}

float TarvexVisuCamera::GetOrthographicZoomFactor() const {
    Camera const* const camera =
        m_context.Read(m_record, "TarvexVisuCamera::GetOrthographicZoomFactor");
    return camera == nullptr ? Camera().orthographicZoomFactor : camera->orthographicZoomFactor;
}
