// The walk of TarvexRenderer over the instances, and the drawing of one reference.
#include <VizBridge/render/TarvexRenderer.h>

#include <VizBridge/contracts/kolba/BodyContext.h>
#include <VizBridge/contracts/kolba/ConstructionContext.h>
#include <VizBridge/contracts/kolba/ContainerContext.h>
#include <VizBridge/contracts/kolba/EntityTypeContext.h>
#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/platform/FormatW.h>
#include <VizBridge/model/BoxTransform.h>
#include <VizBridge/model/SameRenderId.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/services/UniqueServices.h>
#include <VizBridge/services/VizModelerServices.h>

#include <cmath>
#include <cstdint>
#include <vector>

namespace VizBridgeTarvex {

using KolbaVizCore::Node;
using KolbaVizCore::SceneBuilder;

namespace {

constexpr std::uint32_t kProductContainerType = 1;
constexpr unsigned long kTagsPerLevel = 1000;
constexpr std::size_t kBodyNameBufferSize = 64;

template <typename Element>
void appendPresent(std::vector<Element*>& to, std::vector<Element*> const& from) {
    for (Element* element : from) {
        if (element)
            to.push_back(element);
    }
}

} // namespace

bool TarvexRenderer::renderRootInstances() {
    SceneBuilder* const builder = getSceneBuilder();
    std::vector<VizPSEntry*> const roots = m_productStructure->GetChildren();
    m_multipleRoots = roots.size() > 1;

    KolbaVizCore::ConstructionContext const construction(builder);
    if (!construction.IsOK())
        return true;
    KolbaVizCore::SceneContext const scene(builder, Node::RootNodeId, u"ROOT");
    if (!scene.IsOK())
        return true;
    RenderId sceneId;
    if (builder->GetCurrentRenderId(sceneId))
        setRenderId(sceneId);

    WString name = m_productStructure->GetProductName();
    if (m_productTag == 0) {
        // The structure's identity names the product node, so that two products rendered
        // into one scene get two nodes.
        m_productTag =
            static_cast<std::uint32_t>(reinterpret_cast<std::uintptr_t>(m_productStructure));
    }
    if (name.empty())
        makeNameFromTag(m_productTag, name);

    ++m_level;
    {
        KolbaVizCore::ContainerContext const product(builder, m_productTag, name,
                                                     kProductContainerType);
        if (product.IsOK()) {
            RenderId productId;
            if (builder->GetCurrentRenderId(productId)) {
                addToLinkMap(nullptr, m_productTag, productId);
                m_productRenderId = productId;
            }
            VizTransf const identity;
            VizBox geometryBox;
            renderPartGeometry(0, identity, geometryBox);
            m_geometryBox.Add(geometryBox);
            VizBox pmiBox;
            renderPartPMI(0, identity, pmiBox);
            m_geometryBox.Add(pmiBox);

            unsigned long counter = 0;
            for (VizPSEntry* const entry : roots) {
                if (!entry)
                    continue;
                renderChild(*entry, counter, static_cast<unsigned long>(entry->GetID()));
                ++counter;
            }
        }
    }
    --m_level;
    return true;
}

void TarvexRenderer::renderChild(VizPSEntry& entry, unsigned long counter,
                                 unsigned long nameNumber) {
    SceneBuilder* const builder = getSceneBuilder();
    WString referenceName = entry.GetReferenceName();
    if (referenceName.empty())
        makeNameFromTag(nameNumber, referenceName);
    WString instanceName = entry.GetInstanceName();
    if (instanceName.empty())
        instanceName = u"InstanceOfReference_" + referenceName;

    // No limit on the counter: from 1000 children on, tags run into the next level's.
    unsigned long const tag = static_cast<unsigned long>(m_level) * kTagsPerLevel + counter;
    KolbaVizCore::SceneLevelContext const level(builder, static_cast<std::uint32_t>(tag),
                                                instanceName);
    if (!level.IsOK())
        return;
    RenderId id;
    if (builder->GetCurrentRenderId(id))
        addToLinkMap(&entry, tag, id);
    renderInstance(entry);
}

void TarvexRenderer::renderInstance(VizPSEntry& entry) {
    SceneBuilder* const builder = getSceneBuilder();
    ++m_level;
    bool const visible = !(entry.IsHidden() || entry.IsSuppressed());
    VizTransf transformation;
    getTransformation(entry, transformation);
    applyTransform(transformation);
    int const id = entry.GetID();

    // The outermost coloured instance decides the colour of every part below it.
    bool const savedOverride = m_colorOverride;
    if ((entry.HasColor() || entry.HasAlpha()) && !m_colorOverride) {
        RGBAColor color = builder->GetRenderingOptions().GetDefaultFaceColor();
        if (entry.HasColor())
            color = entry.GetColor();
        if (entry.HasAlpha())
            color.alpha = entry.GetColor().alpha;
        m_overrideColor = color;
        m_colorOverride = true;
    }

    // Draws one kind of content of the reference; a hidden instance adds nothing to the extents.
    using PartRender = bool (TarvexRenderer::*)(int const&, VizTransf const&, VizBox&);
    auto const draw = [&](PartRender render) {
        VizBox box;
        (this->*render)(id, transformation, box);
        if (visible)
            m_geometryBox.Add(box);
    };

    if (entry.IsPart()) {
        reportProgress(static_cast<int>(m_brepRenderMap.size() + m_geometryRenderMap.size()) + 1,
                       m_productStructure->GetNumberOfVizPartContainers() +
                           m_productStructure->GetNumberOfVizContainers(),
                       "RenderPart");
        if (m_colorOverride)
            builder->SetCurrentColor(m_overrideColor, true);
        if (entry.GetVizPartContainer())
            draw(&TarvexRenderer::renderPartBREP);
        else if (entry.GetVizContainer())
            draw(&TarvexRenderer::renderPartGeometry);
        if (entry.GetVizPMIContainer())
            draw(&TarvexRenderer::renderPartPMI);
        builder->SetVisibility(visible);
    } else {
        if (entry.GetVizContainer())
            draw(&TarvexRenderer::renderPartGeometry);
        if (entry.GetVizPMIContainer())
            draw(&TarvexRenderer::renderPartPMI);
        builder->SetVisibility(visible);
        std::vector<VizPSEntry*> const children = entry.GetChildren();
        unsigned long counter = 0;
        for (VizPSEntry* const child : children) {
            if (!child)
                continue;
            renderChild(*child, counter, counter);
            ++counter;
        }
    }
    m_colorOverride = savedOverride;
    --m_level;
}

void TarvexRenderer::getTransformation(VizPSEntry const& entry, VizTransf& out) {
    out = entry.GetTransformation();
}

void TarvexRenderer::addToLinkMap(VizPSEntry* entry, unsigned long const& tag, RenderId const& id) {
    std::uint32_t const parent = id.Length() >= 2 ? id[id.Length() - 2] : 0;
    EntityId const key(parent, KolbaVizCore::Link, static_cast<std::uint32_t>(tag));
    m_linkMap.Add(key, id); // the first instance met keeps its key
    if (!entry)
        return;
    entry->Set3DRenderID(id);
    entry->SetEntityID(key);
    if (entry->IsPart())
        addToPartMap(entry, tag, id);
}

void TarvexRenderer::addToPartMap(VizPSEntry*, unsigned long const& tag, RenderId const& id) {
    auto const value = static_cast<std::uint32_t>(tag);
    m_linkMap.Add(EntityId(value, PartRecordType, value), id);
}

bool TarvexRenderer::referenceRecorded(RenderId const& recorded, bool& referenced) {
    SceneBuilder* const builder = getSceneBuilder();
    RenderId current;
    builder->GetCurrentRenderId(current);
    RenderId parentOfRecorded = recorded;
    parentOfRecorded.SetLength(parentOfRecorded.Length() - 1);
    if (SameRenderId(parentOfRecorded, current))
        return false; // drawn below this very node
    referenced = builder->AddNodeReference(recorded);
    return true;
}

void TarvexRenderer::finishBox(VizTransf const& transformation, VizBox const& local, VizBox& box) {
    if (local.IsEmpty())
        return;
    VizModelerServices* const services = rendererServices();
    box = services ? services->ExplodeBox(transformation, local, m_explodeX, m_explodeY, m_explodeZ)
                   : TransformBox(transformation, local);
}

bool TarvexRenderer::renderPartBREP(int const& id, VizTransf const& transformation, VizBox& box) {
    SceneBuilder* const builder = getSceneBuilder();
    bool result = true;
    VizPartContainer* const container = m_productStructure->GetVizPartContainer(id);
    if (!container)
        return true;

    // A part container replaces tessellated geometry drawn before for the reference.
    if (auto const drawn = m_geometryRenderMap.find(id); drawn != m_geometryRenderMap.end()) {
        builder->RemoveNode(drawn->second.path);
        m_geometryRenderMap.erase(drawn);
    }

    VizBox local;
    if (auto const recorded = m_brepRenderMap.find(id); recorded != m_brepRenderMap.end()) {
        local = recorded->second.box;
        bool referenced = false;
        if (referenceRecorded(recorded->second.path, referenced))
            result = referenced;
    } else if (VizModelerServices* const services = rendererServices()) {
        RenderId current;
        builder->GetCurrentRenderId(current);
        // Kept only if it rendered.
        std::unique_ptr<KolbaVizCore::ARenderer> renderer =
            CreateUniqueRenderer(*services, container, builder, &current);
        if (renderer) {
            renderer->SetBuilderOwnership(false);
            if (renderer->Render()) {
                float corners[6];
                renderer->GetGeometryBox(corners);
                double const low[3] = {corners[0], corners[1], corners[2]};
                double const high[3] = {corners[3], corners[4], corners[5]};
                local = VizBox(low, high);
                RenderId const path = renderer->GetRenderId();
                // A renderer kept from an earlier instance that drew nothing worth
                // recording gives way; its nodes go with the product node.
                m_brepRenderers[id] = std::move(renderer);
                if (!current.IsEmpty() && !local.IsEmpty())
                    m_brepRenderMap[id] = RenderedGeometry{path, local};
            } else {
                renderer->ClearAll();
            }
        }
    }
    finishBox(transformation, local, box);
    return result;
}

bool TarvexRenderer::renderPartGeometry(int const& id, VizTransf const& transformation,
                                        VizBox& box) {
    VizBox local;
    if (auto const recorded = m_geometryRenderMap.find(id); recorded != m_geometryRenderMap.end()) {
        local = recorded->second.box;
        bool referenced = false;
        referenceRecorded(recorded->second.path, referenced);
    } else if (VizContainer const* const container = m_productStructure->GetVizContainer(id)) {
        RenderId const path = renderGeom(*container, local);
        // A container with nothing to draw is tried again by the next instance.
        if (!path.IsEmpty() && !local.IsEmpty())
            m_geometryRenderMap[id] = RenderedGeometry{path, local};
    }
    finishBox(transformation, local, box);
    return true;
}

bool TarvexRenderer::renderPartPMI(int const& id, VizTransf const& transformation, VizBox& box) {
    SceneBuilder* const builder = getSceneBuilder();
    VizBox local;
    if (auto const recorded = m_pmiRenderMap.find(id); recorded != m_pmiRenderMap.end()) {
        local = recorded->second.box;
        bool referenced = false;
        if (referenceRecorded(recorded->second.path, referenced) && referenced) {
            // The instance node is another node the PMI renderer's drawing shows under.
            RenderId current;
            auto const renderer = m_pmiRenderers.find(id);
            if (renderer != m_pmiRenderers.end() && renderer->second &&
                builder->GetCurrentRenderId(current) && !current.IsEmpty())
                renderer->second->AddOwnerReference(current[current.Length() - 1]);
        }
    } else if (KolbaVizCore::VizPMIContainer* const container =
                   m_productStructure->GetVizPMIContainer(id)) {
        std::unique_ptr<PmiRenderer>& renderer = m_pmiRenderers[id];
        if (!renderer) {
            // The part's modeler renderer, if one was made, converts the PMI's links; a
            // reference without one gains a null entry here.
            KolbaVizCore::ARenderer* const owner = m_brepRenderers[id].get();
            renderer =
                std::make_unique<PmiRenderer>(container, owner, builder, rendererServices(), false);
            renderer->SetBuilderOwnership(false);
        }
        if (renderer->Render()) {
            RenderId const path = renderer->GetRenderId();
            float corners[6];
            renderer->GetGeometryBox(corners);
            float sum = 0.0f;
            for (float const corner : corners)
                sum += corner;
            if (sum != 0.0f) {
                double const low[3] = {corners[0], corners[1], corners[2]};
                double const high[3] = {corners[3], corners[4], corners[5]};
                local.Add(low);
                local.Add(high);
            }
            // PMI that fills no box is drawn again by the next instance.
            if (!path.IsEmpty() && !local.IsEmpty())
                m_pmiRenderMap[id] = RenderedGeometry{path, local};
        }
    }
    finishBox(transformation, local, box);
    return true;
}

RenderId TarvexRenderer::renderGeom(VizContainer const& container, VizBox& box) {
    SceneBuilder* const builder = getSceneBuilder();
    KolbaVizCore::SceneLevelContext const part(builder, KolbaVizCore::Group, u"Part");
    if (!part.IsOK())
        return RenderId();
    RenderId path;
    builder->GetCurrentRenderId(path);

    float const scale = static_cast<float>(container.GetScaleFactor());
    bool scaled = false;
    VizTransf scaling;
    if (scale != 1.0f && std::fabs(scale) > 1e-5f) {
        scaling = VizTransf(static_cast<double>(scale));
        scaled = true;
    }

    std::vector<KolbaVizCore::VizMesh*> meshes;
    appendPresent(meshes, container.GetMeshes());
    appendPresent(meshes, container.GetCGMeshes());
    std::vector<KolbaVizCore::VizWire*> wires;
    appendPresent(wires, container.GetWires());
    appendPresent(wires, container.GetCGWires());
    std::vector<KolbaVizCore::VizPointSet*> pointSets;
    appendPresent(pointSets, container.GetPointSets());
    appendPresent(pointSets, container.GetCGPointSets());

    // Opens the body node of one element, marks the element with its path and entity id,
    // and lets `draw` fill the node.
    auto const body = [&](VizElement& element, char16_t const* format, auto const& draw) {
        int const elementId = element.GetID();
        KolbaVizCore::BodyContext const context(
            builder, static_cast<std::uint32_t>(elementId),
            VizPort::FormatW(kBodyNameBufferSize, format, {elementId}));
        if (!context.IsOK())
            return;
        if (scaled)
            applyTransform(scaling);
        RenderId bodyPath;
        if (builder->GetCurrentRenderId(bodyPath)) {
            element.Set3DRenderID(bodyPath);
            element.SetEntityID(EntityId(KolbaVizCore::Vis, KolbaVizCore::Body,
                                         static_cast<std::uint32_t>(elementId)));
        }
        draw();
    };

    {
        KolbaVizCore::EntityTypeContext const geometry(builder, KolbaVizCore::Vis, u"Geometry");
        if (geometry.IsOK()) {
            for (auto* const mesh : meshes)
                body(*mesh, u"Mesh%d", [&] { renderVizMesh(*mesh, box, -1); });
            for (auto* const wire : wires)
                body(*wire, u"Wire%d", [&] { renderVizWire(*wire, box); });
            for (auto* const set : pointSets)
                body(*set, u"PointSet%d", [&] { renderVizPointSet(*set, box); });
        }
    }
    // The box was gathered unscaled; it takes the scale even where the body nodes could not.
    box.Scale(static_cast<double>(scale));
    return path;
}

} // namespace VizBridgeTarvex
