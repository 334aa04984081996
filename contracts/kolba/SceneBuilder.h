#pragma once

#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/ContextKind.h>
#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/kolba/RenderingOptions.h>
#include <VizBridge/contracts/kolba/VizBox.h>
#include <VizBridge/contracts/platform/WString.h>

#include <cstdint>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

namespace KolbaVizCore {

class AView3DAdapter;
class GeometryItem;
class VizBox;
struct Ray;

/// A retained scene graph that renderers fill level by level.
///
/// Levels are opened and closed by context objects (SceneContext, ContainerContext,
/// SceneLevelContext, EntityTypeContext, BodyContext, EntityContext; ConstructionContext
/// brackets a construction): the newest open level is the current node, which the Set and
/// Add operations change. A SceneContext opens a scene top; every other context opens a node
/// below the current one and fails when there is none. Opening a tag that already stands
/// below the current node reuses that node as it stands, so that rendering again into one
/// builder finds its nodes again. An EntityContext always makes a new node: entities of one
/// body may share an id, and each keeps its own colour.
///
/// Paths (RenderId) have the leading word 1 and list the tags from the scene top down; a
/// lookup ignores the leading word. Where several children share a tag, a path names the
/// first. A node reference shows the referenced node as if it stood below the referencing
/// node, with its own tag: the path through it is the referencing node's path, the referenced
/// node's tag, and the tags below that. Real children are looked up before references.
///
/// The builder owns its nodes, their items and its geometry item factory; it points at the
/// view adapter, which the host keeps alive. Contexts point at the builder, which must
/// outlive them. Not thread-safe: one thread builds and reads at a time.
class SceneBuilder {
public:
    SceneBuilder();
    /// `view` is not owned; may be null.
    explicit SceneBuilder(AView3DAdapter* view);
    SceneBuilder(SceneBuilder const&) = delete;
    SceneBuilder& operator=(SceneBuilder const&) = delete;
    virtual ~SceneBuilder();

    // The operations renderers call, in this order.

    /// Takes over `item` (which crosses the interface as a raw pointer) and adds it to the
    /// current node. Without a current node the item is destroyed and the answer is false.
    virtual bool AddGeometryItem(GeometryItem* item);
    /// Gives the current node its own colour. With `override` the colour is imposed on
    /// everything below the node, also on what has a colour of its own; without it holds for
    /// what below has none. Nothing happens without a current node.
    virtual void SetCurrentColor(RGBAColor const& color, bool const& override);
    /// The style of the lines of the current node: a pattern such as "dashed" and a width
    /// (below 0: the viewer's default).
    virtual void SetLineStyle(std::string const& pattern, float const& width);
    /// 16 doubles, column-major, as VizTransf::AsArray gives them: the current node's
    /// placement relative to its parent. Null sets the identity.
    virtual void SetCurrentTransform(double const* matrix);
    /// Removes what `path` names. If its last step goes through a node reference, only that
    /// reference goes. Otherwise the node goes with its subtree, and so does every
    /// reference to a node of that subtree, wherever it stands. False if the path names
    /// nothing, or the node or a node below it is still open.
    virtual bool RemoveNode(RenderId const& path);
    /// Shows the node at `path`, with its subtree and its own placement, also below the
    /// current node. The subtree is shared. True also if the current node already referenced
    /// it. False without a current node, for a path that names nothing, and for a reference
    /// that would show a node below itself.
    virtual bool AddNodeReference(RenderId const& path);
    virtual RenderingOptions const& GetRenderingOptions() const;

    /// The path of the current node; false and `id` untouched if there is none.
    bool GetCurrentRenderId(RenderId& id) const;
    /// Shows or hides the current node and so its subtree.
    void SetVisibility(bool const& visible);
    AView3DAdapter* GetView3DAdapter() const { return m_view; }
    void SetView3DAdapter(AView3DAdapter* view) { m_view = view; }
    void SetRenderingOptions(RenderingOptions const& options) { m_options = options; }
    /// The factory renderers make items with; may be null, and then renderers make none.
    AGeometryItemFactory* GetGeometryItemFactory() const { return m_factory.get(); }
    void SetGeometryItemFactory(std::unique_ptr<AGeometryItemFactory> factory);

    // Fault plan, for tests: a context that matches is refused (IsOK false) and opens
    // nothing. Each entry holds until ClearContextFaults.

    void FailContextsNamed(VizPort::WString const& name);
    void FailContextsTagged(std::uint32_t tag);
    /// ContextKind::Construction refuses ConstructionContext.
    void FailContextsOfKind(ContextKind kind);
    void ClearContextFaults();
    /// How many contexts the fault plan has refused so far.
    int GetRefusedContextCount() const { return m_refusedContexts; }

    /// A ConstructionContext is open.
    bool IsConstructing() const { return m_constructionDepth > 0; }
    /// How many levels are open; 0 when every context has closed.
    int GetOpenLevelCount() const { return static_cast<int>(m_open.size()); }

    // Reading the scene.

    std::size_t GetSceneCount() const;
    Node const* GetScene(std::size_t index) const;
    /// The node `path` names, through references too; null if none.
    Node const* FindNode(RenderId const& path) const;
    /// The placement of the node at `path` in world coordinates: the product of the
    /// placements along the path, referenced nodes included. False if the path names nothing.
    bool GetWorldTransform(RenderId const& path, Matrix4& world) const;
    /// Whether every node along `path` is visible.
    bool IsShown(RenderId const& path) const;
    /// The colour the node at `path` shows in: the outermost overriding colour along the
    /// path, else the nearest own colour. False if neither exists or the path names nothing.
    bool GetDisplayColor(RenderId const& path, RGBAColor& color) const;
    /// Adds the shown items of the subtree at `path`, references included, in world
    /// coordinates. False if the path names nothing.
    bool GetWorldBox(RenderId const& path, VizBox& box) const;
    /// Nodes that the builder owns; references count nothing.
    std::size_t GetNodeCount() const;
    /// The scene as text, one line per node, two blanks of indent per level:
    ///   <tag> <kind>[(<container type>)] "<name>"[ T=[r00 r01 r02 tx; … ]][ color=r,g,b,a
    ///   [ override]][ hidden][ line=<pattern>/<width>][ {<item>; <item>}]
    /// then one line "-> ref <tags/of/target>" per reference, then the children.
    std::string Dump() const;
    /// The nearest shown item that `ray` (world coordinates) meets, through references and
    /// placements: a triangle it pierces, or a line, point or text it passes within the pick
    /// tolerance of (see GeometryItem::IntersectRay). True, the path of the item's node and
    /// the distance from the ray's origin to the hit, or for a line, point or text to the
    /// ray's point nearest to it. On a miss false and both left alone.
    bool Pick(Ray const& ray, RenderId& hit, double& distance) const;
    /// Counts the changes to the scene (nodes, items, placements, colours, visibility,
    /// references, the pick tolerance), so that a view may keep an answer while it stays.
    std::uint64_t GetRevision() const { return m_revision; }

    /// The boxes of the subtrees that picks look into, each in its node's coordinates.
    using PickBoxes = std::unordered_map<Node const*, VizBox>;
    /// About three pixels' width on a hand-sized part modelled in millimetres that fills a
    /// screen: lines can be hit with a mouse without a neighbour a few millimetres off
    /// catching the ray. A host that knows its camera sets the width of a few pixels instead.
    static constexpr double DefaultPickTolerance = 0.5;
    /// How far (world units) from a pick ray a line, point or text may lie and still be hit.
    /// False, and the tolerance as it was, for a negative or not finite one.
    bool SetPickTolerance(double tolerance);
    double GetPickTolerance() const { return m_pickTolerance; }
    /// Removes every scene. False, and nothing removed, while a level is open.
    bool Clear();

private:
    friend class ASceneBuilderContext;

    struct Resolution {
        std::vector<Node*> nodes;         ///< from the scene top down to the named node
        bool lastStepIsReference = false; ///< the named node is reached through a reference
    };

    bool beginConstruction();
    void endConstruction();
    /// Opens a level and makes it current; null if refused or if there is no parent.
    Node* openLevel(ContextKind kind, std::uint32_t tag, VizPort::WString const& name,
                    std::uint32_t containerType);
    /// Closes `node` and every level opened after it.
    void closeLevel(Node const* node);
    void colorNode(Node* node, RGBAColor const& color, bool override) const;
    bool isRefused(ContextKind kind, std::uint32_t tag, VizPort::WString const& name) const;
    Node* currentNode() const { return m_open.empty() ? nullptr : m_open.back(); }
    bool resolve(RenderId const& path, Resolution& resolution) const;
    bool reaches(Node const* from, Node const* to) const;
    bool isOpenAtOrBelow(Node const* node) const;
    void detachSubtree(Node* node);

    std::unique_ptr<Node> m_anchor; ///< owns the scene tops; no node of the scene
    std::uint64_t m_revision = 0;
    /// Made by the picks for the scene as it stood at m_pickBoxesRevision.
    mutable PickBoxes m_pickBoxes;
    mutable std::uint64_t m_pickBoxesRevision = 0;
    std::vector<Node*> m_open; ///< open levels, oldest first; owned through m_anchor
    int m_constructionDepth = 0;
    RenderingOptions m_options;
    AView3DAdapter* m_view = nullptr; ///< not owned
    std::unique_ptr<AGeometryItemFactory> m_factory;
    double m_pickTolerance = DefaultPickTolerance;
    std::vector<VizPort::WString> m_failingNames;
    std::vector<std::uint32_t> m_failingTags;
    std::vector<ContextKind> m_failingKinds;
    int m_refusedContexts = 0;
};

} // namespace KolbaVizCore
