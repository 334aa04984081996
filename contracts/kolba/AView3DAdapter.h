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
    /// The path of the same node as it was drawn: for a node shown again through a node
    /// reference, its own path rather than the path through the reference. The elements
    /// drawn there know that path. This base has no scene to look into and answers as
    /// PickRenderId.
    virtual bool PickDrawnRenderId(Ray const& ray, RenderId& id) { return PickRenderId(ray, id); }
};

} // namespace KolbaVizCore
