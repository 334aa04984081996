#pragma once

#include <VizBridge/contracts/kolba/VizPMICollection.h>
#include <VizBridge/contracts/kolba/VizPlane.h>
#include <VizBridge/contracts/platform/WString.h>

#include <string>

namespace KolbaVizCore {

/// A view: PMI grouped in a plane. Its plane, if it has one, is drawn as an outline.
class VizView : public VizPMICollection {
public:
    static std::string TypeID() { return "VizView"; }
    std::string const GetElementType() const override { return TypeID(); }

    /// A point and two directions, three floats each. False, and the plane as it was, if
    /// any is null.
    bool SetPlane(float const* const origin, float const* const firstDirection,
                  float const* const secondDirection) {
        return m_plane.Set(origin, firstDirection, secondDirection);
    }
    bool HasPlane() const { return m_plane.IsSet(); }
    /// False, and the arrays untouched, for a view without a plane.
    bool GetPlane(float* const origin, float* const firstDirection,
                  float* const secondDirection) const {
        return m_plane.Get(origin, firstDirection, secondDirection);
    }
    float const* GetPlaneRectangle() const override { return m_plane.GetRectangle(); }

    /// "View : " and the name; empty for a view without a name.
    VizPort::WString GetViewAsString() const;

private:
    VizPlane m_plane;
};

} // namespace KolbaVizCore
