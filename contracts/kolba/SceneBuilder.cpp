#include <VizBridge/contracts/kolba/SceneBuilder.h>

#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/GeometryItem.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <sstream>
#include <unordered_set>
#include <utility>

namespace KolbaVizCore {

namespace {

char const* kindWord(ContextKind kind) {
    switch (kind) {
    case ContextKind::Construction:
        return "construction";
    case ContextKind::Scene:
        return "scene";
    case ContextKind::Container:
        return "container";
    case ContextKind::SceneLevel:
        return "level";
    case ContextKind::EntityType:
        return "type";
    case ContextKind::Body:
        return "body";
    case ContextKind::Entity:
        return "entity";
    }
    return "node";
}

std::string pathText(RenderId const& path) {
    std::string text;
    for (std::uint32_t const tag : path.GetTags()) {
        if (!text.empty())
            text += '/';
        text += std::to_string(tag);
    }
    return text;
}

void writeTransform(std::ostream& out, Matrix4 const& transform) {
    out << " T=[";
    for (int row = 0; row < 3; ++row) {
        if (row > 0)
            out << "; ";
        for (int column = 0; column < 4; ++column) {
            if (column > 0)
                out << ' ';
            out << transform.At(row, column) + 0.0; // + 0.0 prints -0 as 0
        }
    }
    out << ']';
}

void dumpNode(Node const& node, int depth, std::ostream& out) {
    std::string const indent(static_cast<std::size_t>(depth) * 2, ' ');
    out << indent << node.GetTag() << ' ' << kindWord(node.GetKind());
    if (node.GetKind() == ContextKind::Container)
        out << '(' << node.GetContainerType() << ')';
    out << " \"" << VizPort::Narrow(node.GetName()) << '"';
    if (node.HasTransform())
        writeTransform(out, node.GetTransform());
    if (node.HasOwnColor()) {
        RGBAColor const color = node.GetColor();
        out << " color=" << int{color.red} << ',' << int{color.green} << ',' << int{color.blue}
            << ',' << int{color.alpha};
        if (node.IsColorOverride())
            out << " override";
    }
    if (!node.IsVisible())
        out << " hidden";
    if (node.HasLineStyle()) {
        Node::LineStyle const style = node.GetLineStyle();
        out << " line=" << style.pattern << '/' << style.width;
    }
    if (node.GetItemCount() > 0) {
        out << " {";
        for (std::size_t index = 0; index < node.GetItemCount(); ++index)
            out << (index > 0 ? "; " : "") << node.GetItem(index)->Describe();
        out << '}';
    }
    out << '\n';
    for (std::size_t index = 0; index < node.GetReferenceCount(); ++index)
        out << indent << "  -> ref " << pathText(node.GetReference(index)->GetPath()) << '\n';
    for (std::size_t index = 0; index < node.GetChildCount(); ++index)
        dumpNode(*node.GetChild(index), depth + 1, out);
}

Matrix4 placed(Matrix4 const& parentWorld, Node const& node) {
    return node.HasTransform() ? parentWorld * node.GetTransform() : parentWorld;
}

/// The corners of `box` placed by `transform`, as a box again.
VizBox placedBox(Matrix4 const& transform, VizBox const& box) {
    VizBox placedCorners;
    if (box.IsEmpty())
        return placedCorners;
    for (int corner = 0; corner < 8; ++corner) {
        double const point[3] = {(corner & 1 ? box.GetHigh() : box.GetLow())[0],
                                 (corner & 2 ? box.GetHigh() : box.GetLow())[1],
                                 (corner & 4 ? box.GetHigh() : box.GetLow())[2]};
        double out[3];
        transform.ApplyToPoint(point, out);
        placedCorners.Add(out);
    }
    return placedCorners;
}

/// The box of everything below `node` (its items, children and references, shown or not),
/// in the node's own coordinates. Each node's box is made once per cache: a drawing shown
/// through many references is measured once.
VizBox const& subtreeBox(Node const& node, SceneBuilder::PickBoxes& cache) {
    if (auto const found = cache.find(&node); found != cache.end())
        return found->second;
    VizBox box;
    Matrix4 const identity;
    for (std::size_t index = 0; index < node.GetItemCount(); ++index)
        node.GetItem(index)->AddToBox(identity, box);
    auto const addBelow = [&](Node const& below) {
        VizBox const& inner = subtreeBox(below, cache);
        box.Add(below.HasTransform() ? placedBox(below.GetTransform(), inner) : inner);
    };
    for (std::size_t index = 0; index < node.GetChildCount(); ++index)
        addBelow(*node.GetChild(index));
    for (std::size_t index = 0; index < node.GetReferenceCount(); ++index)
        addBelow(*node.GetReference(index));
    return cache.emplace(&node, box).first->second; // references to elements outlive rehashes
}

/// Whether `ray` passes through `box` widened by `margin` on every side, ahead of its origin.
bool rayMeetsBox(Ray const& ray, VizBox const& box, double margin) {
    if (box.IsEmpty())
        return false;
    double enter = 0.0;
    double leave = std::numeric_limits<double>::infinity();
    for (int axis = 0; axis < 3; ++axis) {
        double const low = box.GetLow()[axis] - margin;
        double const high = box.GetHigh()[axis] + margin;
        double const origin = ray.origin[axis];
        double const direction = ray.direction[axis];
        if (direction == 0.0) {
            if (origin < low || origin > high)
                return false;
            continue;
        }
        double near = (low - origin) / direction;
        double far = (high - origin) / direction;
        if (near > far)
            std::swap(near, far);
        enter = std::max(enter, near);
        leave = std::min(leave, far);
        if (enter > leave)
            return false;
    }
    return true;
}

struct PickState {
    Ray const& ray;
    double tolerance = 0.0;
    SceneBuilder::PickBoxes& boxes;
    bool found = false;
    double nearest = 0.0;
    RenderId hit;
};

void pickBelow(Node const& node, Matrix4 const& parentWorld, RenderId& path, PickState& state) {
    if (!node.IsVisible())
        return;
    Matrix4 const world = placed(parentWorld, node);
    // A subtree the ray passes by is not looked into: most of a large scene is.
    if (!rayMeetsBox(state.ray, placedBox(world, subtreeBox(node, state.boxes)), state.tolerance))
        return;
    path.AddValue(node.GetTag());
    for (std::size_t index = 0; index < node.GetItemCount(); ++index) {
        double t = 0.0;
        // Strictly nearer only: of two equal hits the one met first stands.
        if (node.GetItem(index)->IntersectRay(state.ray, world, state.tolerance, t) &&
            (!state.found || t < state.nearest)) {
            state.found = true;
            state.nearest = t;
            state.hit = path;
        }
    }
    for (std::size_t index = 0; index < node.GetChildCount(); ++index)
        pickBelow(*node.GetChild(index), world, path, state);
    for (std::size_t index = 0; index < node.GetReferenceCount(); ++index)
        pickBelow(*node.GetReference(index), world, path, state);
    path.SetLength(path.Length() - 1);
}

void boxBelow(Node const& node, Matrix4 const& world, VizBox& box) {
    for (std::size_t index = 0; index < node.GetItemCount(); ++index)
        node.GetItem(index)->AddToBox(world, box);
    for (std::size_t index = 0; index < node.GetChildCount(); ++index) {
        Node const& child = *node.GetChild(index);
        if (child.IsVisible())
            boxBelow(child, placed(world, child), box);
    }
    for (std::size_t index = 0; index < node.GetReferenceCount(); ++index) {
        Node const& target = *node.GetReference(index);
        if (target.IsVisible())
            boxBelow(target, placed(world, target), box);
    }
}

std::size_t countBelow(Node const& node) {
    std::size_t count = 1;
    for (std::size_t index = 0; index < node.GetChildCount(); ++index)
        count += countBelow(*node.GetChild(index));
    return count;
}

} // namespace

SceneBuilder::SceneBuilder() : SceneBuilder(nullptr) {}

SceneBuilder::SceneBuilder(AView3DAdapter* view)
    : m_anchor(std::make_unique<Node>(ContextKind::Scene, 0, VizPort::WString(), 0)), m_view(view),
      m_factory(std::make_unique<DefaultGeometryItemFactory>()) {}

SceneBuilder::~SceneBuilder() = default;

bool SceneBuilder::AddGeometryItem(GeometryItem* item) {
    ++m_revision;
    std::unique_ptr<GeometryItem> owned(item); // handed over by the caller
    Node* const node = currentNode();
    if (node == nullptr || !owned)
        return false;
    node->m_items.push_back(std::move(owned));
    return true;
}

void SceneBuilder::SetCurrentColor(RGBAColor const& color, bool const& override) {
    ++m_revision;
    if (Node* const node = currentNode())
        colorNode(node, color, override);
}

void SceneBuilder::SetLineStyle(std::string const& pattern, float const& width) {
    ++m_revision;
    if (Node* const node = currentNode())
        node->m_lineStyle = std::make_unique<Node::LineStyle>(Node::LineStyle{pattern, width});
}

void SceneBuilder::SetCurrentTransform(double const* matrix) {
    ++m_revision;
    if (Node* const node = currentNode())
        node->setTransform(Matrix4(matrix));
}

bool SceneBuilder::RemoveNode(RenderId const& path) {
    ++m_revision;
    Resolution resolution;
    if (!resolve(path, resolution))
        return false;
    Node* const node = resolution.nodes.back();
    if (resolution.lastStepIsReference) {
        Node* const referencing = resolution.nodes[resolution.nodes.size() - 2];
        auto& references = referencing->m_references;
        references.erase(std::find(references.begin(), references.end(), node));
        auto& referrers = node->m_referrers;
        referrers.erase(std::find(referrers.begin(), referrers.end(), referencing));
        return true;
    }
    if (isOpenAtOrBelow(node))
        return false;
    detachSubtree(node);
    // Destroyed here, with its subtree and items.
    node->m_parent->takeChild(node);
    return true;
}

bool SceneBuilder::AddNodeReference(RenderId const& path) {
    ++m_revision;
    Node* const current = currentNode();
    Resolution resolution;
    if (current == nullptr || !resolve(path, resolution))
        return false;
    Node* const target = resolution.nodes.back();
    auto& references = current->m_references;
    if (std::find(references.begin(), references.end(), target) != references.end())
        return true;
    // A node that showed below itself would make the scene endless.
    if (reaches(target, current))
        return false;
    references.push_back(target);
    target->m_referrers.push_back(current);
    return true;
}

RenderingOptions const& SceneBuilder::GetRenderingOptions() const {
    return m_options;
}

bool SceneBuilder::GetCurrentRenderId(RenderId& id) const {
    Node const* const node = currentNode();
    if (node == nullptr)
        return false;
    id = node->GetPath();
    return true;
}

void SceneBuilder::SetVisibility(bool const& visible) {
    ++m_revision;
    if (Node* const node = currentNode())
        node->m_visible = visible;
}

void SceneBuilder::SetGeometryItemFactory(std::unique_ptr<AGeometryItemFactory> factory) {
    m_factory = std::move(factory);
}

void SceneBuilder::FailContextsNamed(VizPort::WString const& name) {
    m_failingNames.push_back(name);
}

void SceneBuilder::FailContextsTagged(std::uint32_t tag) {
    m_failingTags.push_back(tag);
}

void SceneBuilder::FailContextsOfKind(ContextKind kind) {
    m_failingKinds.push_back(kind);
}

void SceneBuilder::ClearContextFaults() {
    m_failingNames.clear();
    m_failingTags.clear();
    m_failingKinds.clear();
}

std::size_t SceneBuilder::GetSceneCount() const {
    return m_anchor->GetChildCount();
}

Node const* SceneBuilder::GetScene(std::size_t index) const {
    return m_anchor->GetChild(index);
}

Node const* SceneBuilder::FindNode(RenderId const& path) const {
    Resolution resolution;
    return resolve(path, resolution) ? resolution.nodes.back() : nullptr;
}

bool SceneBuilder::GetWorldTransform(RenderId const& path, Matrix4& world) const {
    Resolution resolution;
    if (!resolve(path, resolution))
        return false;
    Matrix4 product;
    for (Node const* node : resolution.nodes)
        product = placed(product, *node);
    world = product;
    return true;
}

bool SceneBuilder::IsShown(RenderId const& path) const {
    Resolution resolution;
    if (!resolve(path, resolution))
        return false;
    return std::all_of(resolution.nodes.begin(), resolution.nodes.end(),
                       [](Node const* node) { return node->IsVisible(); });
}

bool SceneBuilder::GetDisplayColor(RenderId const& path, RGBAColor& color) const {
    Resolution resolution;
    if (!resolve(path, resolution))
        return false;
    for (Node const* node : resolution.nodes) {
        if (node->HasOwnColor() && node->IsColorOverride()) {
            color = node->GetColor();
            return true;
        }
    }
    for (auto node = resolution.nodes.rbegin(); node != resolution.nodes.rend(); ++node) {
        if ((*node)->HasOwnColor()) {
            color = (*node)->GetColor();
            return true;
        }
    }
    return false;
}

bool SceneBuilder::GetWorldBox(RenderId const& path, VizBox& box) const {
    Resolution resolution;
    if (!resolve(path, resolution))
        return false;
    Matrix4 world;
    bool shown = true;
    for (Node const* node : resolution.nodes) {
        world = placed(world, *node);
        shown = shown && node->IsVisible();
    }
    if (shown)
        boxBelow(*resolution.nodes.back(), world, box);
    return true;
}

std::size_t SceneBuilder::GetNodeCount() const {
    return countBelow(*m_anchor) - 1;
}

std::string SceneBuilder::Dump() const {
    std::ostringstream out;
    for (std::size_t index = 0; index < m_anchor->GetChildCount(); ++index)
        dumpNode(*m_anchor->GetChild(index), 0, out);
    return out.str();
}

bool SceneBuilder::Pick(Ray const& ray, RenderId& hit, double& distance) const {
    double const length =
        std::sqrt(ray.direction[0] * ray.direction[0] + ray.direction[1] * ray.direction[1] +
                  ray.direction[2] * ray.direction[2]);
    if (!(length > 0.0) || !std::isfinite(length))
        return false;
    if (m_pickBoxesRevision != m_revision) {
        m_pickBoxes.clear();
        m_pickBoxesRevision = m_revision;
    }
    PickState state{ray, m_pickTolerance, m_pickBoxes, false, 0.0, RenderId(1)};
    RenderId path(1);
    Matrix4 const identity;
    for (std::size_t index = 0; index < m_anchor->GetChildCount(); ++index)
        pickBelow(*m_anchor->GetChild(index), identity, path, state);
    if (!state.found)
        return false;
    hit = state.hit;
    distance = state.nearest * length;
    return true;
}

bool SceneBuilder::SetPickTolerance(double tolerance) {
    ++m_revision;
    if (!(tolerance >= 0.0) || !std::isfinite(tolerance))
        return false;
    m_pickTolerance = tolerance;
    return true;
}

bool SceneBuilder::Clear() {
    ++m_revision;
    if (!m_open.empty())
        return false;
    m_anchor->m_children.clear();
    m_anchor->m_childIndex.reset();
    return true;
}

bool SceneBuilder::beginConstruction() {
    if (std::find(m_failingKinds.begin(), m_failingKinds.end(), ContextKind::Construction) !=
        m_failingKinds.end()) {
        ++m_refusedContexts;
        return false;
    }
    ++m_constructionDepth;
    return true;
}

void SceneBuilder::endConstruction() {
    if (m_constructionDepth > 0)
        --m_constructionDepth;
}

Node* SceneBuilder::openLevel(ContextKind kind, std::uint32_t tag, VizPort::WString const& name,
                              std::uint32_t containerType) {
    ++m_revision;
    if (isRefused(kind, tag, name)) {
        ++m_refusedContexts;
        return nullptr;
    }
    Node* const parent = kind == ContextKind::Scene ? m_anchor.get() : currentNode();
    if (parent == nullptr)
        return nullptr;
    Node* node = kind == ContextKind::Entity ? nullptr : parent->findChild(tag);
    if (node == nullptr)
        node = parent->addChild(std::make_unique<Node>(kind, tag, name, containerType));
    m_open.push_back(node);
    return node;
}

void SceneBuilder::closeLevel(Node const* node) {
    auto const found = std::find(m_open.rbegin(), m_open.rend(), node);
    if (found != m_open.rend())
        m_open.erase(std::prev(found.base()), m_open.end());
}

void SceneBuilder::colorNode(Node* node, RGBAColor const& color, bool override) const {
    node->m_color = color;
    node->m_hasColor = true;
    node->m_colorOverride = override;
}

bool SceneBuilder::isRefused(ContextKind kind, std::uint32_t tag,
                             VizPort::WString const& name) const {
    return std::find(m_failingKinds.begin(), m_failingKinds.end(), kind) != m_failingKinds.end() ||
           std::find(m_failingTags.begin(), m_failingTags.end(), tag) != m_failingTags.end() ||
           std::find(m_failingNames.begin(), m_failingNames.end(), name) != m_failingNames.end();
}

bool SceneBuilder::resolve(RenderId const& path, Resolution& resolution) const {
    resolution.nodes.clear();
    resolution.lastStepIsReference = false;
    Node* node = m_anchor.get();
    for (std::uint32_t const tag : path.GetTags()) {
        Node* next = node->findChild(tag);
        bool throughReference = false;
        if (next == nullptr && node != m_anchor.get()) {
            auto const found =
                std::find_if(node->m_references.begin(), node->m_references.end(),
                             [tag](Node const* target) { return target->GetTag() == tag; });
            if (found != node->m_references.end()) {
                next = *found;
                throughReference = true;
            }
        }
        if (next == nullptr)
            return false;
        resolution.nodes.push_back(next);
        resolution.lastStepIsReference = throughReference;
        node = next;
    }
    return !resolution.nodes.empty();
}

bool SceneBuilder::reaches(Node const* from, Node const* to) const {
    // Walks upward from `to`, through owners and referrers: `from` is met if and only if
    // `to` shows somewhere below it.
    std::vector<Node const*> pending{to};
    std::unordered_set<Node const*> seen{to};
    while (!pending.empty()) {
        Node const* const node = pending.back();
        pending.pop_back();
        if (node == from)
            return true;
        auto visit = [&](Node const* up) {
            if (up != nullptr && up != m_anchor.get() && seen.insert(up).second)
                pending.push_back(up);
        };
        visit(node->m_parent);
        for (Node const* referrer : node->m_referrers)
            visit(referrer);
    }
    return false;
}

bool SceneBuilder::isOpenAtOrBelow(Node const* node) const {
    for (Node const* open : m_open) {
        for (Node const* up = open; up != nullptr; up = up->m_parent) {
            if (up == node)
                return true;
        }
    }
    return false;
}

void SceneBuilder::detachSubtree(Node* node) {
    std::vector<Node*> nodes{node};
    for (std::size_t next = 0; next < nodes.size(); ++next) {
        for (std::unique_ptr<Node> const& child : nodes[next]->m_children)
            nodes.push_back(child.get());
    }
    std::unordered_set<Node*> const inside(nodes.begin(), nodes.end());
    auto isInside = [&inside](Node* each) { return inside.count(each) != 0; };
    // Gathered first, so that each node outside is cleaned in one pass however many
    // references it has into the subtree.
    std::unordered_set<Node*> targets;
    std::unordered_set<Node*> referrers;
    for (Node* each : nodes) {
        for (Node* target : each->m_references) {
            if (!isInside(target))
                targets.insert(target);
        }
        for (Node* referrer : each->m_referrers) {
            if (!isInside(referrer))
                referrers.insert(referrer);
        }
    }
    for (Node* target : targets)
        std::erase_if(target->m_referrers, isInside);
    for (Node* referrer : referrers)
        std::erase_if(referrer->m_references, isInside);
}

} // namespace KolbaVizCore
