#pragma once

namespace KolbaVizCore {

class IView3D;
class RenderId;
struct Ray;

/// The renderers' and hosts' handle on the viewer: the view that shows the scene, and what
/// lies under a ray.
class AView3DAdapter {
public:
    virtual ~AView3DAdapter() = default;

    /// The view; may be null when no viewer is attached.
    virtual IView3D* GetView3D() = 0;
    /// The path of the nearest shown node that `ray` (world coordinates) hits: true and
    /// `id` filled; false and `id` untouched on a miss.
    virtual bool PickRenderId(Ray const& ray, RenderId& id) = 0;
};

} // namespace KolbaVizCore
