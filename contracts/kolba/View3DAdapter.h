#pragma once

#include <VizBridge/contracts/kolba/AView3DAdapter.h>

namespace KolbaVizCore {

class SceneBuilder;

/// An adapter over a view and the scene it shows: GetView3D gives the view, PickRenderId
/// picks in the scene. Owns neither; both may be null, and must outlive the adapter.
class View3DAdapter : public AView3DAdapter {
public:
    View3DAdapter(IView3D* view, SceneBuilder const* scene) : m_view(view), m_scene(scene) {}

    IView3D* GetView3D() override { return m_view; }
    bool PickRenderId(Ray const& ray, RenderId& id) override;

private:
    IView3D* m_view;             ///< not owned
    SceneBuilder const* m_scene; ///< not owned
};

} // namespace KolbaVizCore
