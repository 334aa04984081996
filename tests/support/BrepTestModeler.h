#pragma once

#include "support/ScriptedModeler.h"
#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/ARenderer.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>

#include <cstdint>
#include <stdexcept>

namespace VizBridgeTarvex {

/// A modeler renderer that draws one node (tag 10011, "Brep") with one triangle below the
/// current node, and reports a fixed box. Counts the live instances, so that tests see
/// every one of them deleted exactly once.
class TestBrepRenderer : public KolbaVizCore::ARenderer {
public:
    enum class Outcome { Draw, Fail, Throw };

    TestBrepRenderer(KolbaVizCore::SceneBuilder* builder, Outcome outcome, VizBox box)
        : ARenderer(builder, nullptr), m_outcome(outcome), m_box(box) {
        ++live();
    }
    ~TestBrepRenderer() override { --live(); }
    static int& live() {
        static int count = 0;
        return count;
    }
    static int& cleared() {
        static int count = 0;
        return count;
    }

    bool Render() override {
        if (m_outcome == Outcome::Throw)
            throw std::runtime_error("modeler renderer broke");
        KolbaVizCore::SceneLevelContext const node(getSceneBuilder(), 10011, u"Brep");
        if (!node.IsOK())
            return false;
        RenderId id;
        getSceneBuilder()->GetCurrentRenderId(id);
        setRenderId(id);
        float const vertices[9] = {0, 0, 0, 1, 0, 0, 0, 1, 0};
        int const indices[3] = {0, 1, 2};
        if (auto* factory = getGeometryItemFactory())
            getSceneBuilder()->AddGeometryItem(
                factory->MakePolygon(0, vertices, nullptr, indices, 9, 0, 3, 1));
        return m_outcome == Outcome::Draw;
    }
    void ClearAll() override {
        ++cleared();
        if (!GetRenderId().IsEmpty())
            getSceneBuilder()->RemoveNode(GetRenderId());
        setRenderId(RenderId());
    }
    bool Convert(RenderId const&, EntityId&) override { return false; }
    bool Convert(EntityId const&, RenderId&) override { return false; }
    bool ConvertToHighlight(RenderId const&, RenderId*&, int&) override { return false; }
    void GetGeometryCenter(float* const center) const override {
        center[0] = center[1] = center[2] = 0.0f;
    }
    float GetGeometryRadius() const override { return 0.0f; }
    void GetGeometryBox(float* const box) const override {
        for (int i = 0; i < 3; ++i) {
            box[i] = static_cast<float>(m_box.GetLow()[i]);
            box[3 + i] = static_cast<float>(m_box.GetHigh()[i]);
        }
    }

protected:
    bool preRender() override { return true; }
    void postRender() override {}

private:
    Outcome m_outcome;
    VizBox m_box;
};

/// A modeler whose renderers are TestBrepRenderers with the outcome the test chose, and
/// whose ExplodeBox moves a box by the placement's translation and then by its centre
/// times the factors.
class BrepTestModeler : public ScriptedModeler {
public:
    TestBrepRenderer::Outcome outcome = TestBrepRenderer::Outcome::Draw;
    VizBox box = unitBox();
    int* created = nullptr; ///< counts CreateRenderer calls over all clones, if set

    static VizBox unitBox() {
        double const low[3] = {0, 0, 0}, high[3] = {1, 1, 1};
        return VizBox(low, high);
    }

    KolbaVizCore::ARenderer* CreateRenderer(VizPartContainer* container,
                                            KolbaVizCore::SceneBuilder* builder,
                                            RenderId*) override {
        if (!container)
            return nullptr;
        if (created)
            ++*created;
        return new TestBrepRenderer(builder, outcome, box); // the caller owns it
    }
    VizModelerServices* Clone() override { return new BrepTestModeler(*this); }
    VizBox ExplodeBox(VizTransf const& transformation, VizBox const& in, double const& x,
                      double const& y, double const& z) override {
        double const factors[3] = {x, y, z};
        double center[3];
        in.GetCenter(center);
        double low[3], high[3];
        for (int axis = 0; axis < 3; ++axis) {
            double const shift =
                transformation.GetTranslation()[axis] +
                (center[axis] + transformation.GetTranslation()[axis]) * factors[axis];
            low[axis] = in.GetLow()[axis] + shift;
            high[axis] = in.GetHigh()[axis] + shift;
        }
        return VizBox(low, high);
    }
};

} // namespace VizBridgeTarvex
