#include <VizBridge/modelerkit/BrepPartRenderer.h>

#include <VizBridge/contracts/kolba/BodyContext.h>
#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/contracts/kolba/EntityTypeContext.h>
#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>

#include <algorithm>
#include <cmath>
#include <initializer_list>
#include <string>
#include <utility>

namespace VizModelerKit {

using KolbaVizCore::EntityId;
using KolbaVizCore::Node;
using KolbaVizCore::RenderId;
using KolbaVizCore::SceneBuilder;

namespace {

// Offsets from the length of the part node's path, where the product renderer reads them.
constexpr int BodyIndex = 2;   ///< the body's tag: the parent id of a face or edge
constexpr int TypeIndex = 3;   ///< Faces or Edges
constexpr int EntityIndex = 4; ///< the face's or edge's id

/// The node below `path` that `tags` lead to, as a path.
RenderId below(RenderId path, std::initializer_list<std::uint32_t> tags) {
    for (std::uint32_t const tag : tags)
        path.AddValue(tag);
    return path;
}

} // namespace

BrepPartRenderer::BrepPartRenderer(SceneBuilder& builder, RenderId current)
    : ARenderer(&builder, nullptr), m_current(std::move(current)) {}

BrepPartRenderer::~BrepPartRenderer() = default;

bool BrepPartRenderer::Render() {
    SceneBuilder* const builder = getSceneBuilder();
    RenderId parentPath;
    if (builder == nullptr || !builder->GetCurrentRenderId(parentPath))
        return false;
    if (!GetRenderId().IsEmpty()) {
        // Entity nodes are never reused: drawing again would double every face and edge.
        if (partNode() != nullptr)
            return true;
        renderId().Clear(); // someone removed the drawing: draw it anew
    }
    // The caller records the part node's path and tells its own instance from the others
    // by cutting one tag off it: below another node, that test would fail.
    if (!m_current.IsEmpty() && m_current.GetTags() != parentPath.GetTags())
        return false;
    // A part node that is there already is another renderer's drawing; opening its tag
    // would reuse it and add a second set of faces.
    Node const* const parent = builder->FindNode(parentPath);
    if (parent == nullptr || parent->FindChild(PartTag) != nullptr)
        return false;

    KolbaVizCore::SceneLevelContext const part(builder, PartTag, u"BrepPart");
    if (!part.IsOK())
        return false;
    RenderId path;
    builder->GetCurrentRenderId(path);
    setRenderId(path);
    drawBrep(*builder);
    return true;
}

void BrepPartRenderer::ClearAll() {
    SceneBuilder* const builder = getSceneBuilder();
    // A drawing that was removed already leaves nothing to remove; the answer says no more.
    if (builder != nullptr && !GetRenderId().IsEmpty())
        builder->RemoveNode(GetRenderId());
    renderId().Clear();
}

bool BrepPartRenderer::Convert(RenderId const& id, EntityId& entity) {
    int const base = GetRenderId().Length();
    if (GetRenderId().IsEmpty() || id.Length() <= base + BodyIndex || !leadsIntoDrawing(id))
        return false;
    std::uint32_t const body = id[base + BodyIndex];
    if (body != bodyTag())
        return false;
    if (id.Length() <= base + EntityIndex) {
        entity = EntityId(body, KolbaVizCore::Body, body);
        return true;
    }
    std::uint32_t const type = id[base + TypeIndex];
    std::uint32_t const entityId = id[base + EntityIndex];
    if (!hasEntity(type, entityId))
        return false;
    entity = EntityId(body, type, entityId);
    return true;
}

bool BrepPartRenderer::Convert(EntityId const& entity, RenderId& id) {
    SceneBuilder* const builder = getSceneBuilder();
    std::uint32_t const body = bodyTag();
    if (builder == nullptr || GetRenderId().IsEmpty() || entity.GetParentId() != body)
        return false;
    RenderId const bodyPath = below(GetRenderId(), {BrepTag, KolbaVizCore::Body, body});
    RenderId path;
    if (entity.GetType() == KolbaVizCore::Body && entity.GetId() == body)
        path = bodyPath;
    else if (hasEntity(entity.GetType(), entity.GetId()))
        path = below(bodyPath, {entity.GetType(), entity.GetId()});
    else
        return false;
    // A refused level left its entities out of the scene: no path for them.
    if (builder->FindNode(path) == nullptr)
        return false;
    RenderId relative(1);
    for (int index = omittedHead(); index < path.Length(); ++index)
        relative.AddValue(path[index]);
    id = std::move(relative);
    return true;
}

RenderId BrepPartRenderer::InScene(RenderId const& relative) const {
    if (GetRenderId().IsEmpty())
        return RenderId();
    RenderId path(1);
    for (int index = 0; index < omittedHead(); ++index)
        path.AddValue(GetRenderId()[index]);
    for (std::uint32_t const tag : relative.GetTags())
        path.AddValue(tag);
    return path;
}

int BrepPartRenderer::omittedHead() const {
    // The scene top and the product node; never the part node itself.
    constexpr int kSceneAndProduct = 2;
    return std::min(kSceneAndProduct, GetRenderId().Length() - 1);
}

bool BrepPartRenderer::ConvertToHighlight(RenderId const& id, RenderId*& ids, int& count) {
    if (GetRenderId().IsEmpty() || !leadsIntoDrawing(id))
        return false;
    // The interface hands the array to the caller, who releases it with delete[].
    ids = new RenderId[1]{id};
    count = 1;
    return true;
}

void BrepPartRenderer::GetGeometryCenter(float* const center) const {
    float box[6];
    GetGeometryBox(box);
    bool const empty = box[0] > box[3] || box[1] > box[4] || box[2] > box[5];
    // Halved before they are added, so that a box near the float range has a centre too.
    for (int axis = 0; axis < 3; ++axis)
        center[axis] = empty ? 0.0f : box[axis] / 2.0f + box[axis + 3] / 2.0f;
}

float BrepPartRenderer::GetGeometryRadius() const {
    float box[6];
    GetGeometryBox(box);
    double sum = 0.0;
    for (int axis = 0; axis < 3; ++axis) {
        if (box[axis] > box[axis + 3])
            return 0.0f;
        double const extent = static_cast<double>(box[axis + 3]) - box[axis];
        sum += extent * extent;
    }
    return static_cast<float>(std::sqrt(sum) / 2.0);
}

void BrepPartRenderer::GetGeometryBox(float* const box) const {
    KolbaVizCore::VizBox const part = GetRenderId().IsEmpty() ? KolbaVizCore::VizBox() : partBox();
    for (int axis = 0; axis < 3; ++axis) {
        box[axis] = static_cast<float>(part.GetLow()[axis]);
        box[axis + 3] = static_cast<float>(part.GetHigh()[axis]);
    }
}

bool BrepPartRenderer::preRender() {
    return true;
}

void BrepPartRenderer::postRender() {}

VizPort::WString BrepPartRenderer::numbered(char const* word, std::uint32_t number) {
    return VizPort::Widen(word + std::to_string(number));
}

void BrepPartRenderer::drawBrep(SceneBuilder& builder) const {
    KolbaVizCore::SceneLevelContext const brep(&builder, BrepTag, u"Brep");
    if (!brep.IsOK())
        return;
    KolbaVizCore::EntityTypeContext const bodies(&builder, KolbaVizCore::Body, u"Bodies");
    if (!bodies.IsOK())
        return;
    KolbaVizCore::BodyContext const body(&builder, bodyTag(), numbered("Body", bodyTag()));
    if (!body.IsOK())
        return;
    drawFaces(builder);
    drawEdges(builder);
}

Node const* BrepPartRenderer::partNode() const {
    SceneBuilder const* const builder = getSceneBuilder();
    if (builder == nullptr || GetRenderId().IsEmpty())
        return nullptr;
    return builder->FindNode(GetRenderId());
}

bool BrepPartRenderer::leadsIntoDrawing(RenderId const& id) const {
    Node const* const part = partNode();
    int const base = GetRenderId().Length();
    if (part == nullptr || id.Length() < base)
        return false;
    // The head of the path must reach this very node: through a referencing node the
    // path differs from the drawing's own, and still names the same shared subtree.
    RenderId head = id;
    head.SetLength(base);
    return getSceneBuilder()->FindNode(head) == part && getSceneBuilder()->FindNode(id) != nullptr;
}

} // namespace VizModelerKit
