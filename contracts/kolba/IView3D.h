#pragma once

namespace KolbaVizCore {

class VizBox;

/// The viewer that shows a scene, as renderers reach it through an AView3DAdapter.
class IView3D {
public:
    virtual ~IView3D() = default;

    /// The sphere the rendered geometry fills: its centre (three floats) and radius.
    virtual void SetGeometryExtents(float const* center, float const& radius) = 0;
    /// The box the rendered geometry fills.
    virtual void SetGeometryExtents(VizBox const& box) = 0;
    /// Switches on an option of the viewer; what an option does is the viewer's affair.
    virtual void SetViewOption(int const& option) = 0;
};

} // namespace KolbaVizCore
