#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredEntity.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCamera.h>

#include <array>
#include <optional>
#include <vector>

/// Three points or directions of three floats each, in an order that their field names.
using TarvexVisuTriples = std::array<std::array<float, 3>, 3>;

struct TarvexAuthoredVisuCamera {
    TarvexVisuCamera::TarvexVisuCameraType type = TarvexVisuCamera::CameraUnknown;
    std::optional<TarvexVisuTriples> orientation; ///< position, target, up direction
    float perspectiveViewAngle = 0;
    float orthographicZoomFactor = 1;
};

/// A view: a named group of annotations in a plane.
struct TarvexAuthoredVisuView {
    std::optional<bool> hidden;
    std::optional<VizPort::WString> displayName;
    std::optional<VizPort::WString> id;
    std::optional<VizPort::WString> mechanicalId;
    std::optional<TarvexVisuTriples> axis; ///< origin, first direction, second direction
    std::vector<VizPort::WString> annotationIds;
};

/// A capture: a named group of annotations and constructed geometry, seen by a camera, and
/// possibly the bodies that it shows.
struct TarvexAuthoredVisuCapture {
    std::optional<bool> hidden;
    std::optional<bool> active;
    TarvexAuthoredVisuCamera camera;
    std::optional<VizPort::WString> displayName;
    std::optional<VizPort::WString> id;
    std::optional<VizPort::WString> mechanicalId;
    std::optional<VizPort::WString> hiddenText;
    std::optional<TarvexVisuTriples> clippingPlane; ///< origin, normal, first in-plane direction
    std::vector<VizPort::WString> annotationIds;
    std::vector<VizPort::WString> ftaConstructedGeometryIds;
    bool managesGeometry = false;
    std::vector<TarvexAuthoredEntity> bodies;
};
