#pragma once

#include <VizBridge/render/AVizRenderer.h>

#include <cstdint>
#include <map>
#include <vector>

namespace KolbaVizCore {
class VizPMI;
class VizPMICollection;
class VizPMIContainer;
} // namespace KolbaVizCore

namespace VizBridgeTarvex {

/// Draws one reference's PMI container at the SceneBuilder's current node: "PMI" with a
/// node per group and PMI object (edges, faces, texts) and the constructed FTA geometry,
/// then "Views" and "Captures" beside it, each view or capture with its plane outline.
/// Afterwards it converts between the paths it drew and entity ids.
///
/// A reference's PMI is drawn once and shown under every instance of the reference: the
/// renderer keeps the tags of the nodes its drawing shows under (`AddOwnerReference`), and
/// takes a path as its own when the tag in front of its "PMI", "Views" or "Captures" is one
/// of them.
///
/// Points at the container, the owner renderer (the part's modeler renderer, used only for
/// conversions, may be null) and the SceneBuilder; owns none of them. Owns a clone of the
/// modeler services. The element maps point at elements of the container. Deleting the
/// renderer leaves the scene alone: the "PMI" node goes with its owner's scene.
class PmiRenderer : public AVizRenderer {
public:
    PmiRenderer(KolbaVizCore::VizPMIContainer* container, KolbaVizCore::ARenderer* owner,
                KolbaVizCore::SceneBuilder* builder, VizModelerServices* services,
                bool const& ownerPathsComplete);
    /// Member by member: a copy points at the same container, owner and nodes.
    PmiRenderer(PmiRenderer const& other) = default;
    PmiRenderer& operator=(PmiRenderer const& other) = default;
    ~PmiRenderer() override;

    /// Another node that the drawing shows under; doubles are kept.
    void AddOwnerReference(unsigned long const& tag);

    /// Draws "PMI", "Views" and "Captures"; true unless preRender refuses. Without a
    /// container or a builder nothing is drawn and the answer is still true.
    bool Render() override;
    /// Removes the views and captures and forgets every record; the "PMI" node stays, for
    /// the owner of the scene to remove.
    void ClearAll() override;

    /// The entity id of a path this renderer drew: the PMI object for anything below it,
    /// the group, an FTA element, a view or capture, or one of the top nodes. False for a
    /// path that is not this renderer's; `entity` is then untouched.
    bool Convert(RenderId const& id, EntityId& entity) override;
    /// The path of a recorded element; a summary key (id, parent id and type equal) gives
    /// the node above the element that stands for it. False, with `id` empty, otherwise.
    bool Convert(EntityId const& entity, RenderId& id) override;
    /// What to light up for a pick in this renderer's drawing: for a PMI object the object,
    /// then the model entities it is linked to (through the owner renderer, under the root
    /// instance that was picked), then the PMI objects it refers to; for a view or capture
    /// itself and its members. False for a path that is not this renderer's. `ids` is a new
    /// array of `count` paths that the caller releases with delete[].
    bool ConvertToHighlight(RenderId const& id, RenderId*& ids, int& count) override;
    /// The text for a picked PMI object, FTA element, view or capture, with the container's
    /// reference id; empty for anything else.
    WString GetToolTip(RenderId const& id) override;

    // Read by tests and by the highlighting.
    std::map<EntityId, VizElement const*> const& PMIElements() const { return m_pmiElements; }
    std::map<EntityId, VizElement const*> const& ViewElements() const { return m_viewElements; }
    std::map<EntityId, VizElement const*> const& CaptureElements() const {
        return m_captureElements;
    }
    std::vector<std::uint32_t> const& OwnerReferences() const { return m_ownerReferences; }
    RenderId const& ViewsRenderId() const { return m_viewsRenderId; }
    RenderId const& CapturesRenderId() const { return m_capturesRenderId; }

protected:
    bool preRender() override;
    void postRender() override;

    RenderId renderPMI();
    RenderId renderViews();
    RenderId renderCaptures();
    void renderVizPMI(KolbaVizCore::VizPMI& pmi, VizBox& box, VizTransf const& transformation);
    void renderVizViewCap(KolbaVizCore::VizPMICollection& collection);

    /// True if one of the tags "PMI", "Views" or "Captures" in `id` stands behind a tag of
    /// m_ownerReferences; `owner` is that tag, or 0xFFFFFFFF.
    bool isOwned(RenderId const& id, unsigned long& owner);
    bool isOwned(unsigned long const& tag);

    bool convertToHighlightPMI(RenderId const& id, RenderId*& ids, int& count);
    bool convertToHighlightView(RenderId const& id, RenderId*& ids, int& count);
    bool convertToHighlightCapture(RenderId const& id, RenderId*& ids, int& count);
    /// The picked object's path (`parent`), the paths of what `element` is linked to.
    void getPMIRenderIDs(RenderId const& picked, RenderId const& parent, VizElement const* element,
                         RenderId*& ids, int& count);

private:
    /// A view or capture and its members; `map` is the one of its kind.
    bool convertToHighlightCollection(RenderId const& id,
                                      std::map<EntityId, VizElement const*>& map, RenderId*& ids,
                                      int& count);
    /// The index of the last "PMI" tag of `id`; 0 if it has none.
    static int lastPMITag(RenderId const& id);
    /// Hands `paths` to the caller as a new array, which the interface makes the caller's.
    static bool handOver(std::vector<RenderId> const& paths, RenderId*& ids, int& count);
    /// Removes the views and captures and forgets the records; preRender and ClearAll.
    void forgetDrawing();
    /// Records `element` under the entity id of the current path, and gives it both ids.
    void recordAtCurrentPath(VizElement& element, std::map<EntityId, VizElement const*>& map);
    /// The edges or faces of a PMI object: one level node, one coloured entity node each.
    template <typename Piece, typename Draw>
    void renderPieces(std::vector<Piece*> const& pieces, KolbaVizCore::EntityType type,
                      char16_t const* levelName, char16_t const* pieceName,
                      RGBAColor const& defaultColor, Draw const& draw);
    template <typename Collection>
    RenderId renderCollections(KolbaVizCore::EntityType type, char16_t const* name,
                               std::vector<Collection*> const& collections,
                               std::map<EntityId, VizElement const*>& map);

    std::map<EntityId, VizElement const*> m_pmiElements;     ///< not owned
    std::map<EntityId, VizElement const*> m_viewElements;    ///< not owned
    std::map<EntityId, VizElement const*> m_captureElements; ///< not owned
    KolbaVizCore::VizPMIContainer* m_pmiContainer;           ///< not owned
    KolbaVizCore::ARenderer* m_ownerRenderer;                ///< not owned; may be null
    bool m_ownerPathsComplete;
    std::vector<std::uint32_t> m_ownerReferences;
    RenderId m_capturesRenderId;
    RenderId m_viewsRenderId;
};

} // namespace VizBridgeTarvex
