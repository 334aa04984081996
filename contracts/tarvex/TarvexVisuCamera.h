#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <memory>

struct TarvexAuthoredVisuCamera;

/// The camera of a capture. A default object is a camera of unknown type without
/// orientation.
class TarvexVisuCamera {
public:
    /// The values are the library's interface.
    enum TarvexVisuCameraType : int {
        CameraUnknown = 0,
        CameraPerspective = 1,
        CameraOrthographic = 2,
    };

    TarvexVisuCamera() = default;
    TarvexVisuCamera(TarvexVisuContext context,
                     std::shared_ptr<TarvexAuthoredVisuCamera const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    /// The authored type, which need not be one of the enumerators.
    TarvexVisuCameraType GetType() const;
    /// True and the position, target and up direction, three floats each, when the camera
    /// has an orientation; the arrays are left alone when it has none.
    bool GetOrientation(float* const position, float* const target, float* const up) const;
    /// In degrees; 0 for a camera that has none.
    float GetPerspectiveViewAngle() const;
    /// 1 for a camera that has none.
    float GetOrthographicZoomFactor() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuCamera const> m_record; ///< shares the import's data
};
