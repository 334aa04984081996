#pragma once

#include <VizBridge/contracts/kolba/ContextKind.h>
#include <VizBridge/contracts/kolba/GeometryItem.h>
#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/platform/WString.h>

#include <cstdint>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

namespace KolbaVizCore {

/// One node of a SceneBuilder's scene: a tag, a name, the kind of context that made it, a
/// placement, a colour, a visibility, a line style, geometry items and child nodes, which it
/// owns, and references to nodes elsewhere in the scene, which it only points at: a
/// referenced node's subtree shows again below this node, shared, not copied. Nodes are made,
/// changed and destroyed by their SceneBuilder only; hosts and tests read them.
class Node {
public:
    /// The tag of the scene top that renderers open as "ROOT".
    static constexpr std::uint32_t RootNodeId = 1;
    /// A fresh id for a node, from a process-wide source that only grows. Safe on any
    /// thread. Ids start at 0x01000000, above every tag the system gives by rule (instance
    /// levels, entity types), so that a generated id never reads as such a tag.
    static std::uint32_t GetNextId();

    struct LineStyle {
        std::string pattern; ///< e.g. "dashed"
        float width = -1.0f; ///< below 0: the viewer's default width
    };

    Node(ContextKind kind, std::uint32_t tag, VizPort::WString name, std::uint32_t containerType);
    Node(Node const&) = delete;
    Node& operator=(Node const&) = delete;
    ~Node();

    std::uint32_t GetTag() const { return m_tag; }
    ContextKind GetKind() const { return m_kind; }
    VizPort::WString GetName() const { return m_name; }
    /// The container type given to a ContainerContext; 0 for other kinds.
    std::uint32_t GetContainerType() const { return m_containerType; }
    /// The node that owns this one; null for a scene top.
    Node const* GetParent() const;
    /// The path from the scene top down to this node through owners, leading word 1.
    RenderId GetPath() const;

    Matrix4 GetTransform() const { return m_transform ? *m_transform : Matrix4(); }
    bool HasTransform() const { return m_transform != nullptr; }

    /// A node's own colour. With `IsColorOverride` it is imposed on everything below the
    /// node; without, it holds for what below has no colour of its own.
    bool HasOwnColor() const { return m_hasColor; }
    RGBAColor GetColor() const { return m_color; }
    bool IsColorOverride() const { return m_colorOverride; }

    /// The node's own flag; a node also stays unseen below a hidden one.
    bool IsVisible() const { return m_visible; }

    bool HasLineStyle() const { return m_lineStyle != nullptr; }
    LineStyle GetLineStyle() const { return m_lineStyle ? *m_lineStyle : LineStyle(); }

    std::size_t GetItemCount() const { return m_items.size(); }
    GeometryItem const* GetItem(std::size_t index) const { return m_items[index].get(); }
    std::size_t GetChildCount() const { return m_children.size(); }
    Node const* GetChild(std::size_t index) const { return m_children[index].get(); }
    /// The first child with `tag`, or null.
    Node const* FindChild(std::uint32_t tag) const;
    std::size_t GetReferenceCount() const { return m_references.size(); }
    Node const* GetReference(std::size_t index) const { return m_references[index]; }
    /// How many nodes reference this one.
    std::size_t GetReferrerCount() const { return m_referrers.size(); }

private:
    friend class SceneBuilder;

    Node* findChild(std::uint32_t tag) const;
    Node* addChild(std::unique_ptr<Node> child);
    /// Hands the child back to the caller, which destroys it.
    std::unique_ptr<Node> takeChild(Node const* child);
    void setTransform(Matrix4 const& transform);

    std::uint32_t m_tag;
    std::uint32_t m_containerType;
    ContextKind m_kind;
    bool m_hasColor = false;
    bool m_colorOverride = false;
    bool m_visible = true;
    RGBAColor m_color;
    VizPort::WString m_name;
    Node* m_parent = nullptr; ///< the owner; not owned
    // Absent stands for the identity and for no line style: most nodes have neither, and a
    // scene of many instances stays small.
    std::unique_ptr<Matrix4> m_transform;
    std::unique_ptr<LineStyle> m_lineStyle;
    std::vector<std::unique_ptr<GeometryItem>> m_items;
    std::vector<std::unique_ptr<Node>> m_children;
    /// The first child of each tag, kept only once a node has many children.
    std::unique_ptr<std::unordered_map<std::uint32_t, Node*>> m_childIndex;
    std::vector<Node*> m_references; ///< nodes shown again below this one; not owned
    std::vector<Node*> m_referrers;  ///< nodes that reference this one; not owned
};

} // namespace KolbaVizCore
