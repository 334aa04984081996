#include <VizBridge/contracts/kolba/Node.h>

#include <algorithm>
#include <atomic>
#include <utility>

namespace KolbaVizCore {

namespace {

// Looking up a tag among a few children is faster by a scan than by a hash.
constexpr std::size_t ChildIndexThreshold = 16;

std::atomic<std::uint32_t> nextId{0x01000000u};

} // namespace

std::uint32_t Node::GetNextId() {
    return nextId.fetch_add(1u);
}

Node::Node(ContextKind kind, std::uint32_t tag, VizPort::WString name, std::uint32_t containerType)
    : m_tag(tag), m_containerType(containerType), m_kind(kind), m_name(std::move(name)) {}

Node::~Node() = default;

Node const* Node::GetParent() const {
    // The builder's hidden anchor owns the scene tops; it is no node of the scene.
    return m_parent != nullptr && m_parent->m_parent != nullptr ? m_parent : nullptr;
}

RenderId Node::GetPath() const {
    std::vector<std::uint32_t> tags;
    for (Node const* node = this; node != nullptr && node->m_parent != nullptr;
         node = node->m_parent)
        tags.push_back(node->m_tag);
    RenderId path(1);
    for (auto tag = tags.rbegin(); tag != tags.rend(); ++tag)
        path.AddValue(*tag);
    return path;
}

Node const* Node::FindChild(std::uint32_t tag) const {
    return findChild(tag);
}

Node* Node::findChild(std::uint32_t tag) const {
    if (m_childIndex) {
        auto const found = m_childIndex->find(tag);
        return found == m_childIndex->end() ? nullptr : found->second;
    }
    for (std::unique_ptr<Node> const& child : m_children) {
        if (child->m_tag == tag)
            return child.get();
    }
    return nullptr;
}

Node* Node::addChild(std::unique_ptr<Node> child) {
    Node* const added = child.get();
    added->m_parent = this;
    m_children.push_back(std::move(child));
    if (m_childIndex) {
        m_childIndex->emplace(added->m_tag, added); // keeps an earlier child of the tag
    } else if (m_children.size() > ChildIndexThreshold) {
        m_childIndex = std::make_unique<std::unordered_map<std::uint32_t, Node*>>();
        for (std::unique_ptr<Node> const& each : m_children)
            m_childIndex->emplace(each->m_tag, each.get());
    }
    return added;
}

std::unique_ptr<Node> Node::takeChild(Node const* child) {
    auto const found =
        std::find_if(m_children.begin(), m_children.end(),
                     [child](std::unique_ptr<Node> const& each) { return each.get() == child; });
    if (found == m_children.end())
        return nullptr;
    std::unique_ptr<Node> taken = std::move(*found);
    m_children.erase(found);
    if (m_childIndex) {
        auto const entry = m_childIndex->find(taken->m_tag);
        if (entry != m_childIndex->end() && entry->second == taken.get()) {
            m_childIndex->erase(entry);
            // Another child of the same tag, if any, now comes first.
            for (std::unique_ptr<Node> const& each : m_children) {
                if (each->m_tag == taken->m_tag) {
                    m_childIndex->emplace(each->m_tag, each.get());
                    break;
                }
            }
        }
    }
    taken->m_parent = nullptr;
    return taken;
}

void Node::setTransform(Matrix4 const& transform) {
    if (transform.IsIdentity())
        m_transform.reset();
    else if (m_transform)
        *m_transform = transform;
    else
        m_transform = std::make_unique<Matrix4>(transform);
}

} // namespace KolbaVizCore
