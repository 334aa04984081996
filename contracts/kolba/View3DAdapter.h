#pragma once

#include <VizBridge/contracts/kolba/AView3DAdapter.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/RenderId.h>

#include <cstdint>

namespace KolbaVizCore {

class SceneBuilder;

/// An adapter over a view and the scene it shows: GetView3D gives the view, PickRenderId
/// picks in the scene. Owns neither; both may be null, and must outlive the adapter.
class View3DAdapter : public AView3DAdapter {
public:
    View3DAdapter(IView3D* view, SceneBuilder const* scene) : m_view(view), m_scene(scene) {}

    IView3D* GetView3D() override { return m_view; }
    bool PickRenderId(Ray const& ray, RenderId& id) override;
    bool PickDrawnRenderId(Ray const& ray, RenderId& id) override;

private:
    /// The answer for the last ray, kept while the scene stays as it was: one question of
    /// a host is asked of every container in turn, and each would pick the scene again.
    struct LastPick {
        bool valid = false;
        Ray ray;
        std::uint64_t revision = 0;
        bool found = false;
        RenderId picked;
        RenderId drawn;
    };
    LastPick const& pick(Ray const& ray);

    IView3D* m_view;             ///< not owned
    SceneBuilder const* m_scene; ///< not owned
    LastPick m_last;
};

} // namespace KolbaVizCore
