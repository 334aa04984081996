#pragma once

// The parts Pin and Bolt imported by the reference modeler, and the scene levels the product
// renderer opens before a modeler draws a part, for the reference modeler's tests.

#include <VizBridge/contracts/kolba/ARenderer.h>
#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>
#include <VizBridge/referencemodeler/ReferenceBrepRenderer.h>
#include <VizBridge/referencemodeler/ReferenceModelerServices.h>
#include <VizBridge/referencemodeler/ReferencePartContainer.h>

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <vector>

namespace VizReferenceModeler {

constexpr unsigned int PinId = 3;
constexpr unsigned int BoltId = 4;

/// Pin (3): face 101 of two triangles, face 102 of one, edges 201 (2 points) and 202
/// (3 points), spanning (0, 0, 0) to (2, 1, 3). Bolt (4): one face also numbered 101, and no
/// edge. Pin.1 (instance 1) and Bolt.1 (instance 2) stand at the top.
inline TarvexModel MakeModel() {
    TarvexModel model;
    model.SetProductName(u"Frame");
    TarvexAuthoredPartGeometry& pin = model.AddPart(PinId, u"Pin").geometry;
    pin.faces.push_back({101, {0, 0, 0, 2, 0, 0, 2, 1, 0, 0, 1, 0}, {0, 1, 2, 0, 2, 3}});
    pin.faces.push_back({102, {0, 0, 3, 2, 0, 3, 0, 1, 3}, {0, 1, 2}});
    pin.edges.push_back({201, {0, 0, 0, 0, 0, 3}});
    pin.edges.push_back({202, {0, 0, 0, 2, 0, 0, 2, 1, 0}});
    model.AddPart(BoltId, u"Bolt")
        .geometry.faces.push_back({101, {5, 5, 5, 6, 5, 5, 5, 6, 5}, {0, 1, 2}});
    model.AddRootInstance(PinId, u"Pin.1");
    model.AddRootInstance(BoltId, u"Bolt.1");
    return model;
}

/// The box from (x0, y0, z0) to (x1, y1, z1).
inline VizBox Box(double x0, double y0, double z0, double x1, double y1, double z1) {
    double const low[3] = {x0, y0, z0}, high[3] = {x1, y1, z1};
    return VizBox(low, high);
}

/// What one ImportPart call gave; owns the container if one came back.
struct Imported {
    bool ok = false;
    std::unique_ptr<VizPartContainer> container;
    TarvexPartImportResult result;
    WString error;

    ReferencePartContainer const* part() const {
        return dynamic_cast<ReferencePartContainer const*>(container.get());
    }
};

inline Imported Import(ReferenceModelerServices& services, TarvexModel const& model,
                       unsigned int referenceId) {
    Imported out;
    TarvexPartDocument document = model.GetInputProductStructure()
                                      .GetReferenceFromId(static_cast<int>(referenceId))
                                      .GetDocument();
    VizPartContainer* raw = nullptr; // set only when the call succeeds
    out.ok = services.ImportPart(static_cast<int>(referenceId), document, out.result, raw, nullptr,
                                 out.error);
    out.container.reset(raw);
    return out;
}

/// ROOT, the product (77) and one instance node open, as the product renderer has them when
/// a modeler draws a part.
class InstanceLevels {
public:
    static constexpr std::uint32_t ProductTag = 77;

    InstanceLevels(KolbaVizCore::SceneBuilder& builder, std::uint32_t instance)
        : m_construction(&builder), m_scene(&builder, KolbaVizCore::Node::RootNodeId, u"ROOT"),
          m_product(&builder, ProductTag, u"Product"), m_instance(&builder, instance, u"Instance") {
    }

private:
    KolbaVizCore::ConstructionContext const m_construction;
    KolbaVizCore::SceneContext const m_scene;
    KolbaVizCore::SceneLevelContext const m_product;
    KolbaVizCore::SceneLevelContext const m_instance;
};

/// The path 1/77/`instance`/`below...`.
inline RenderId InstancePath(std::uint32_t instance, std::vector<std::uint32_t> const& below = {}) {
    RenderId path(1);
    for (std::uint32_t const tag :
         {KolbaVizCore::Node::RootNodeId, InstanceLevels::ProductTag, instance})
        path.AddValue(tag);
    for (std::uint32_t const tag : below)
        path.AddValue(tag);
    return path;
}

/// Below the part node of a drawing at `instance`: the body of `part`, then `below`.
inline RenderId InPart(std::uint32_t instance, std::uint32_t part,
                       std::vector<std::uint32_t> below = {}) {
    below.insert(below.begin(), {ReferenceBrepRenderer::PartTag, ReferenceBrepRenderer::BrepTag,
                                 KolbaVizCore::Body, part});
    return InstancePath(instance, below);
}

/// A scene with the default item factory, the modeler, and Pin and Bolt imported by it.
class ReferenceModelerScene : public ::testing::Test {
protected:
    ReferenceModelerScene() {
        builder.SetGeometryItemFactory(
            std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    }

    /// A renderer for `container` made and rendered below instance node `instance` the way
    /// the product renderer does it; `rendered` receives what Render answered.
    std::unique_ptr<KolbaVizCore::ARenderer> Draw(VizPartContainer* container,
                                                  std::uint32_t instance, bool& rendered) {
        InstanceLevels const levels(builder, instance);
        RenderId current;
        builder.GetCurrentRenderId(current);
        std::unique_ptr<KolbaVizCore::ARenderer> renderer(
            services.CreateRenderer(container, &builder, &current));
        rendered = renderer && renderer->Render();
        return renderer;
    }
    /// Renders `renderer` again with instance node `instance` current.
    bool RenderAt(KolbaVizCore::ARenderer& renderer, std::uint32_t instance) {
        InstanceLevels const levels(builder, instance);
        return renderer.Render();
    }
    /// Shows what `path` names below instance node `instance` too, as a further instance.
    bool Reference(std::uint32_t instance, RenderId const& path) {
        InstanceLevels const levels(builder, instance);
        return builder.AddNodeReference(path);
    }

    TarvexModel const model = MakeModel();
    ReferenceModelerServices services;
    Imported const pin = Import(services, model, PinId);
    Imported const bolt = Import(services, model, BoltId);
    KolbaVizCore::SceneBuilder builder;
};

} // namespace VizReferenceModeler
