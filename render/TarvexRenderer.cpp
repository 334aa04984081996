#include <VizBridge/render/TarvexRenderer.h>

#include <VizBridge/contracts/kolba/AView3DAdapter.h>
#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/contracts/kolba/Dbg.h>
#include <VizBridge/contracts/kolba/IView3D.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/services/VizModelerServices.h>

#include <cmath>
#include <exception>
#include <mutex>
#include <new>
#include <ostream>
#include <stdexcept>
#include <string>

namespace VizBridgeTarvex {

TarvexRenderer* TarvexRenderer::MakeRenderer(VizProductStructure* structure,
                                             VizModelerServices* services,
                                             KolbaVizCore::SceneBuilder* builder, double const& x,
                                             double const& y, double const& z) {
    if (!structure)
        return nullptr;
    // The caller owns the new renderer.
    return new (std::nothrow) TarvexRenderer(structure, builder, services, x, y, z);
}

TarvexRenderer::TarvexRenderer(VizProductStructure* structure, KolbaVizCore::SceneBuilder* builder,
                               VizModelerServices* services, double const& x, double const& y,
                               double const& z)
    : AVizRenderer(builder, services), m_productStructure(structure), m_explodeX(x), m_explodeY(y),
      m_explodeZ(z) {}

TarvexRenderer::TarvexRenderer(TarvexRenderer const& other)
    : AVizRenderer(other), m_productStructure(other.m_productStructure),
      m_colorOverride(other.m_colorOverride), m_overrideColor(other.m_overrideColor),
      m_clearBeforeRender(other.m_clearBeforeRender), m_explodeX(other.m_explodeX),
      m_explodeY(other.m_explodeY), m_explodeZ(other.m_explodeZ) {}

TarvexRenderer& TarvexRenderer::operator=(TarvexRenderer const& other) {
    if (this == &other)
        return *this;
    // What this renderer drew goes first: the copy starts unrendered.
    cleanPSData();
    AVizRenderer::operator=(other);
    m_productStructure = other.m_productStructure;
    m_colorOverride = other.m_colorOverride;
    m_overrideColor = other.m_overrideColor;
    m_clearBeforeRender = other.m_clearBeforeRender;
    m_explodeX = other.m_explodeX;
    m_explodeY = other.m_explodeY;
    m_explodeZ = other.m_explodeZ;
    return *this;
}

TarvexRenderer::~TarvexRenderer() {
    try {
        ClearAll();
    } catch (...) {
        // A sub-renderer that throws while clearing must not end the program from a
        // destructor; what it left in the scene goes with the product node or the builder.
    }
    m_productStructure = nullptr;
    m_productRenderId.Clear();
}

bool TarvexRenderer::Render() {
    std::string message;
    bool failed = false;
    bool result = false;
    {
        std::lock_guard<VizPort::RecursiveLock> const guard(m_renderLock);
        int total = 0;
        try {
            if (!m_productStructure)
                throw std::logic_error("the renderer has no product structure");
            total = m_productStructure->GetNumberOfVizPartContainers() +
                    m_productStructure->GetNumberOfVizContainers();
            m_level = 0;
            if (!getSceneBuilder()) // the walk skips what it cannot open: say why nothing shows
                KolbaVizCore::dbg << "TarvexRenderer::Render : the renderer has no scene "
                                     "builder, so nothing is drawn"
                                  << std::endl;
            reportProgress(0, total, "RenderInit");
            result = renderRootInstances();
            if (result && updateExtentsFromBox()) {
                if (auto* const adapter = getView3DAdapter()) {
                    if (auto* const view = adapter->GetView3D())
                        view->SetGeometryExtents(m_geometryCenter, m_geometryRadius);
                }
            }
        } catch (std::exception const& e) {
            failed = true;
            message = e.what();
        } catch (...) {
            failed = true;
            message = "Unhandled Exception";
        }
        // Also after a failure: what the walk recorded answers the conversions.
        m_linkMap.Finish();
        reportProgress(total == 0 ? 1 : total, total == 0 ? 1 : total, "RenderEnd");
    }
    if (failed) {
        message = "TarvexRenderer::Render : " + message;
        KolbaVizCore::dbg << message << std::endl;
        if (KolbaVizCore::GetAllowThrow())
            throw std::runtime_error(message);
    }
    return result;
}

void TarvexRenderer::ClearAll() {
    cleanPSData();
    clearBase();
}

void TarvexRenderer::ExplodeView(double const& x, double const& y, double const& z) {
    m_explodeX = x;
    m_explodeY = y;
    m_explodeZ = z;
}

bool TarvexRenderer::preRender() {
    if (!m_productStructure)
        return false;
    m_geometryBox = VizBox();
    m_geometryRadius = 0.0f;
    for (float& value : m_geometryCenter)
        value = 0.0f;
    cleanPSData();
    return true;
}

void TarvexRenderer::postRender() {
    // Nothing to finish: Render leaves the scene complete, and whoever drives the renderer
    // through ARenderer calls this only for symmetry with preRender.
}

void TarvexRenderer::cleanPSData() {
    if (m_productRenderId.Length() <= 1)
        return;
    for (auto& [id, renderer] : m_brepRenderers) {
        if (renderer) {
            renderer->ClearAll();
            renderer.reset();
        }
    }
    m_brepRenderers.clear();
    m_pmiRenderers.clear(); // their "PMI" nodes go with the product node
    m_pmiRenderMap.clear();
    if (auto* const builder = getSceneBuilder())
        builder->RemoveNode(m_productRenderId);
    m_productRenderId.Clear();
    m_geometryRenderMap.clear();
    m_brepRenderMap.clear();
    m_productTag = 0;
    m_linkMap.Clear();
    m_level = 0;
    m_multipleRoots = false;
}

void TarvexRenderer::reportProgress(int done, int total, char const* phase) const {
    if (auto const callback = GetProgressCallback())
        callback(done, total, phase);
}

} // namespace VizBridgeTarvex
