#pragma once

#include <VizBridge/contracts/kolba/VizPMICollection.h>
#include <VizBridge/contracts/kolba/VizPlane.h>
#include <VizBridge/contracts/platform/WString.h>

#include <array>
#include <string>

namespace KolbaVizCore {

/// A capture: PMI grouped with a camera, a clipping plane and a text to show while the
/// capture is hidden. Its clipping plane, if it has one, is drawn as an outline.
class VizCapture : public VizPMICollection {
public:
    enum CameraType {
        UndefinedCamera = 0,
        PerspectiveCamera = 1,
        OrthographicCamera = 2,
    };

    static std::string TypeID() { return "VizCapture"; }
    std::string const GetElementType() const override { return TypeID(); }

    void SetCameraType(CameraType type) { m_cameraType = type; }
    CameraType GetCameraType() const { return m_cameraType; }

    /// The camera's position, target and up direction, three floats each. False, and the
    /// orientation as it was, if any is null.
    bool SetOrientation(float const* const position, float const* const target,
                        float const* const up);
    bool HasOrientation() const { return m_hasOrientation; }
    /// False, and the arrays untouched, without an orientation; each null array is skipped.
    bool GetOrientation(float* const position, float* const target, float* const up) const;

    /// Meaningful for a perspective camera; 0 until set.
    void SetPerspectiveViewAngle(float angle) { m_viewAngle = angle; }
    float GetPerspectiveViewAngle() const { return m_viewAngle; }
    /// Meaningful for an orthographic camera; 1 until set.
    void SetOrthographicZoomFactor(float factor) { m_zoomFactor = factor; }
    float GetOrthographicZoomFactor() const { return m_zoomFactor; }

    void SetHiddenText(VizPort::WString const& text) { m_hiddenText = text; }
    VizPort::WString GetHiddenText() const { return m_hiddenText; }

    /// Three triples of floats, kept as given. False, and the plane as it was, if any is null.
    bool SetClippingPlane(float const* const first, float const* const second,
                          float const* const third) {
        return m_clippingPlane.Set(first, second, third);
    }
    bool HasClippingPlane() const { return m_clippingPlane.IsSet(); }
    /// False, and the arrays untouched, for a capture without a clipping plane.
    bool GetClippingPlane(float* const first, float* const second, float* const third) const {
        return m_clippingPlane.Get(first, second, third);
    }
    /// The outline of the clipping plane, its first triple taken as a point and the others as
    /// directions.
    float const* GetPlaneRectangle() const override { return m_clippingPlane.GetRectangle(); }

    /// "Capture : " and the name; empty for a capture without a name.
    VizPort::WString GetCaptureAsString() const;

private:
    CameraType m_cameraType = UndefinedCamera;
    bool m_hasOrientation = false;
    std::array<float, 9> m_orientation{};
    float m_viewAngle = 0.0f;
    float m_zoomFactor = 1.0f;
    VizPort::WString m_hiddenText;
    VizPlane m_clippingPlane;
};

} // namespace KolbaVizCore
