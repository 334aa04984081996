#pragma once

#include <VizBridge/contracts/platform/RecursiveLock.h>
#include <VizBridge/render/AVizRenderer.h>
#include <VizBridge/render/LinkMap.h>
#include <VizBridge/render/PmiRenderer.h>
#include <VizBridge/render/RenderedGeometry.h>

#include <cstdint>
#include <map>
#include <memory>

namespace VizBridgeTarvex {

class VizProductStructure;
class VizPSEntry;

/// Turns a VizProductStructure into a scene, and afterwards answers questions about it.
///
/// The scene: "ROOT", the product node, one node per instance with its placement, override
/// colour and visibility; below the first instance of a reference what the reference holds
/// (the modeler's BREP, or the tessellated geometry, and its PMI), and below every further
/// instance a node reference to that drawing.
///
/// Points at the product structure and the SceneBuilder, which the host keeps alive until
/// the renderer is deleted; owns the sub-renderers the modeler services made for it, the PMI
/// renderers it made, and its own clone of the services. Deleting a rendered renderer removes its
/// nodes from the scene.
class TarvexRenderer : public AVizRenderer {
public:
    /// The type of the part records among the instance records; no entity type has it.
    static constexpr std::uint32_t PartRecordType = 40000;

    /// A new renderer, owned by the caller; null for a null structure, which cannot be
    /// rendered. `services` and `builder` stay the caller's; either may be null (without
    /// services no BREP is drawn and boxes are only moved, not exploded).
    static TarvexRenderer* MakeRenderer(VizProductStructure* structure,
                                        VizModelerServices* services,
                                        KolbaVizCore::SceneBuilder* builder, double const& x,
                                        double const& y, double const& z);

    /// A copy renders the same structure with the same settings, but starts unrendered: it
    /// shares no drawing and no sub-renderer with the original, and has a lock of its own.
    TarvexRenderer(TarvexRenderer const& other);
    TarvexRenderer& operator=(TarvexRenderer const& other);
    /// Removes what was drawn; the SceneBuilder must still be alive.
    ~TarvexRenderer() override;

    /// Draws the whole product. Never throws unless the scene library's throw switch is on;
    /// a failure is reported on KolbaVizCore::dbg. Without a SceneBuilder nothing is drawn,
    /// the answer is still true, and KolbaVizCore::dbg says so.
    bool Render() override;
    /// Removes the drawing and the sub-renderers, and forgets the box.
    void ClearAll() override;

    /// The entity a picked path names: PMI through the PMI renderers, a BREP entity through
    /// the modeler, a tessellated body, or else the deepest instance or part recorded above
    /// the node. False, with `entity` default, for a path of no recorded node.
    bool Convert(RenderId const& id, EntityId& entity) override;
    /// The path of an entity: the product, PMI, a tessellated body, an instance or part
    /// record, or a BREP body through the modeler's renderers. False, with `id` empty (or
    /// the modeler renderer's path, if one answered without placing it), otherwise.
    bool Convert(EntityId const& entity, RenderId& id) override;
    /// What to light up for a pick: for PMI the object and what it is linked to (several
    /// paths), otherwise one path: the body or instance above the pick. `ids` is a new
    /// array that the caller releases with delete[].
    bool ConvertToHighlight(RenderId const& id, RenderId*& ids, int& count) override;
    /// PMI as its renderer tells it; a face, edge or vertex as "Face with ID: <id>\nParent
    /// Body ID: <body>"; empty for anything else.
    WString GetToolTip(RenderId const& id) override;

    /// Stored only; they act on the boxes of the next render.
    void ExplodeView(double const& x, double const& y, double const& z);
    void SetClearBeforeRender(bool clear) { m_clearBeforeRender = clear; }
    bool GetClearBeforeRender() const { return m_clearBeforeRender; }
    RenderId GetProductRenderId() const { return m_productRenderId; }

protected:
    TarvexRenderer(VizProductStructure* structure, KolbaVizCore::SceneBuilder* builder,
                   VizModelerServices* services, double const& x, double const& y, double const& z);

    bool preRender() override;
    void postRender() override;
    /// Undoes a render: sub-renderers, the product's nodes and every record.
    void cleanPSData();

    // The walk over the instances.
    bool renderRootInstances();
    void renderInstance(VizPSEntry& entry);
    void getTransformation(VizPSEntry const& entry, VizTransf& out);
    void addToLinkMap(VizPSEntry* entry, unsigned long const& tag, RenderId const& id);
    void addToPartMap(VizPSEntry* entry, unsigned long const& tag, RenderId const& id);

    // One reference's content, drawn once and referenced by further instances.
    bool renderPartBREP(int const& id, VizTransf const& transformation, VizBox& box);
    bool renderPartGeometry(int const& id, VizTransf const& transformation, VizBox& box);
    bool renderPartPMI(int const& id, VizTransf const& transformation, VizBox& box);
    RenderId renderGeom(VizContainer const& container, VizBox& box);

    // The id conversions.
    bool convertToHighlightPart(RenderId const& id, RenderId*& ids, int& count);
    bool convertBREP(RenderId const& id, EntityId& entity);

    // Read by the id conversions.
    VizProductStructure* productStructure() const { return m_productStructure; }
    bool hasMultipleRoots() const { return m_multipleRoots; }
    LinkMap const& linkMap() const { return m_linkMap; }
    std::map<int, RenderedGeometry> const& brepRenderMap() const { return m_brepRenderMap; }
    std::map<int, RenderedGeometry> const& geometryRenderMap() const { return m_geometryRenderMap; }
    std::map<int, std::unique_ptr<KolbaVizCore::ARenderer>>& brepRenderers() {
        return m_brepRenderers;
    }
    std::map<int, RenderedGeometry> const& pmiRenderMap() const { return m_pmiRenderMap; }
    std::map<int, std::unique_ptr<PmiRenderer>> const& pmiRenderers() const {
        return m_pmiRenderers;
    }

private:
    /// The child step: opens the entry's node, records it and renders what stands below.
    void renderChild(VizPSEntry& entry, unsigned long counter, unsigned long nameNumber);
    /// True if a further instance added a node reference to `recorded`; `referenced`
    /// receives what AddNodeReference answered.
    bool referenceRecorded(RenderId const& recorded, bool& referenced);
    /// Moves a drawn box by the instance's placement and the explode factors into `box`.
    void finishBox(VizTransf const& transformation, VizBox const& local, VizBox& box);
    void reportProgress(int done, int total, char const* phase) const;
    /// The path of a BREP body through the modeler's renderers, placed below the drawing of
    /// the renderer that answered when its path does not run through the product node.
    bool convertBREPBody(EntityId const& entity, RenderId& id);

    VizProductStructure* m_productStructure; ///< not owned
    RenderId m_productRenderId;
    bool m_multipleRoots = false;
    std::uint32_t m_productTag = 0;
    std::map<int, RenderedGeometry> m_brepRenderMap;
    /// Per reference id, the renderer the modeler services made; a value may be null.
    std::map<int, std::unique_ptr<KolbaVizCore::ARenderer>> m_brepRenderers;
    std::map<int, RenderedGeometry> m_geometryRenderMap;
    std::map<int, RenderedGeometry> m_pmiRenderMap;
    /// Per reference id, the renderer of its PMI container, made on its first instance.
    std::map<int, std::unique_ptr<PmiRenderer>> m_pmiRenderers;
    /// Instances and parts by entity id; sorted once the walk is done.
    LinkMap m_linkMap;
    int m_level = 0;
    bool m_colorOverride = false;
    RGBAColor m_overrideColor;
    bool m_clearBeforeRender = true;
    double m_explodeX;
    double m_explodeY;
    double m_explodeZ;
    VizPort::RecursiveLock m_renderLock{1024};
};

} // namespace VizBridgeTarvex
