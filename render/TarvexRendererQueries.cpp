// What a viewer asks TarvexRenderer after a render: entity ids for picked paths and back,
// the paths to highlight, tool tips. None of these changes the scene.
#include <VizBridge/render/TarvexRenderer.h>

#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/VizContainer.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/platform/FormatW.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/services/VizModelerServices.h>

#include <algorithm>
#include <memory>
#include <vector>

namespace VizBridgeTarvex {

namespace {

using KolbaVizCore::Node;

/// The tag of the first root instance.
constexpr std::uint32_t kFirstInstanceTag = 1000;
/// Where the part renderer's drawing starts when there is no renderer to ask: below the
/// scene top, the product and the instance.
constexpr int kDefaultBrepBase = 4;
/// From the base of a BREP drawing to the tag of its body, and on to the entity's.
constexpr int kBodyOffset = 3;
constexpr int kEntityOffset = 2;
/// Paths that are short enough to name an instance are highlighted as they are.
constexpr int kShortestPartPick = 8;
/// The length of a pick below the "Geometry" node of a single root part.
constexpr int kPartPickLength = 9;
/// From a deep pick, the tags that lead from its instance down to the element.
constexpr int kTagsBelowInstance = 5;
constexpr std::size_t kToolTipBufferSize = 128;

bool isPMIPath(RenderId const& id) {
    auto const& tags = id.GetTags();
    return std::any_of(tags.begin(), tags.end(), [](std::uint32_t tag) {
        return tag == KolbaVizCore::PMI || tag == KolbaVizCore::Views ||
               tag == KolbaVizCore::Captures;
    });
}

/// The first `length` tags of `id` (all of them if it is shorter).
RenderId head(RenderId id, int length) {
    if (id.Length() > length)
        id.SetLength(length);
    return id;
}

/// Hands one path to the caller as a new array, which the interface makes the caller's.
bool handOver(RenderId const& path, RenderId*& ids, int& count) {
    auto array = std::make_unique<RenderId[]>(1);
    array[0] = path;
    ids = array.release();
    count = 1;
    return true;
}

/// The element of `elements` with the entity id `entity` and a path; null if there is none.
template <typename Element>
Element const* findDrawn(std::vector<Element*> const& elements, EntityId const& entity) {
    for (Element const* const element : elements) {
        EntityId own;
        if (element && element->GetEntityID(own) && own == entity &&
            element->Find3DRenderID() != nullptr)
            return element;
    }
    return nullptr;
}

/// A word for an entity type, in front of the numbers of a tool tip.
char16_t const* typeWord(std::uint32_t type) {
    switch (type) {
    case KolbaVizCore::Vertex:
        return u"Vertex";
    case KolbaVizCore::Edge:
        return u"Edge";
    case KolbaVizCore::Face:
        return u"Face";
    default:
        return u"";
    }
}

} // namespace

bool TarvexRenderer::Convert(EntityId const& entity, RenderId& id) {
    id = RenderId();
    std::uint32_t const type = entity.GetType();
    bool found = false;
    if (type == KolbaVizCore::Group && entity.GetParentId() == 1) {
        id.AddValue(Node::RootNodeId);
        id.AddValue(m_productTag);
        found = true;
    }
    if (!found && entity.IsAnnotation()) {
        for (auto const& [reference, renderer] : m_pmiRenderers) {
            if (renderer && renderer->Convert(entity, id)) {
                found = true;
                break;
            }
        }
    }
    if (!found && entity.GetParentId() == KolbaVizCore::Vis && type == KolbaVizCore::Body &&
        m_productStructure) {
        // Meshes and wires only: point sets and constructed geometry keep no entity to find.
        for (auto const& [reference, container] : m_productStructure->GetAllVizContainers()) {
            if (!container)
                continue;
            VizElement const* element = findDrawn(container->GetMeshes(), entity);
            if (!element)
                element = findDrawn(container->GetWires(), entity);
            if (element && element->Get3DRenderID(id)) {
                found = true;
                break;
            }
        }
    }
    EntityId key;
    if (!found && type == KolbaVizCore::Vis)
        found = m_linkMap.FindFirstWithId(entity.GetId(), key, id);
    if (!found && type == KolbaVizCore::Link)
        found = m_linkMap.Find(entity, id);
    // A part record may answer for an instance record of the same id, and the reverse.
    if (!found && (type == PartRecordType || type == KolbaVizCore::Link))
        found = m_linkMap.FindFirstWithId(entity.GetId(), key, id);
    if (!found && type == KolbaVizCore::Vis && !m_multipleRoots) {
        // The "Geometry" node of the single part, whether or not it was drawn.
        id = m_productRenderId;
        for (std::uint32_t const tag :
             {kFirstInstanceTag, static_cast<std::uint32_t>(KolbaVizCore::Group),
              static_cast<std::uint32_t>(KolbaVizCore::Vis)})
            id.AddValue(tag);
        found = true;
    }
    if (!found && type == KolbaVizCore::Body && !m_brepRenderers.empty())
        found = convertBREPBody(entity, id);
    if (found)
        id.SetLeading(1);
    return found;
}

bool TarvexRenderer::convertBREPBody(EntityId const& entity, RenderId& id) {
    EntityId const body(entity.GetId(), KolbaVizCore::Body, entity.GetId());
    RenderId base;
    RenderId sub;
    for (auto const& [reference, renderer] : m_brepRenderers) {
        if (!renderer || !renderer->Convert(body, sub))
            continue;
        base = renderer->GetRenderId();
        if (sub.Length() > 2 && sub[1] == m_productTag) {
            id = sub;
            return true;
        }
    }
    id = base;
    if (sub.Length() <= 2)
        return false;
    // A modeler renderer that draws below an instance gives its paths from the product's
    // child down (so that a PMI renderer can place them under any root instance): the tags
    // from index 2 on go below the drawing, once, and without the levels between the root
    // instance and the drawing that the path repeats.
    int first = 2;
    int const repeated = base.Length() - 2;
    if (repeated > first && sub.Length() > repeated &&
        std::equal(base.GetTags().begin() + 2, base.GetTags().end(), sub.GetTags().begin()))
        first = repeated;
    for (int index = first; index < sub.Length(); ++index)
        id.AddValue(sub[index]);
    return true;
}

bool TarvexRenderer::Convert(RenderId const& id, EntityId& entity) {
    entity = EntityId();
    bool found = false;
    if (isPMIPath(id)) {
        for (auto const& [reference, renderer] : m_pmiRenderers) {
            if (renderer && renderer->Convert(id, entity)) {
                found = true;
                break;
            }
        }
    } else {
        found = convertBREP(id, entity);
        int const length = id.Length();
        if (!found && !m_multipleRoots && length > 4 && id[4] == KolbaVizCore::Vis) {
            std::uint32_t const last = id[length - 1];
            entity = EntityId(length > 5 ? id[length - 2] : last, KolbaVizCore::Vis, last);
            found = true;
        }
    }
    if (!found) {
        // The deepest instance or part recorded above the node.
        RenderId path;
        found = m_linkMap.FindLongestPrefix(id, entity, path);
    }
    return found;
}

bool TarvexRenderer::convertBREP(RenderId const& id, EntityId& entity) {
    if (!m_productStructure)
        return false;
    VizModelerServices* const services = rendererServices();
    for (auto const& [reference, container] : m_productStructure->GetAllVizPartContainers()) {
        // A reference met here for the first time gains a null renderer, which every walk
        // over the renderers skips.
        std::unique_ptr<KolbaVizCore::ARenderer> const& renderer = m_brepRenderers[reference];
        int const base = renderer ? renderer->GetRenderId().Length() : kDefaultBrepBase;
        if (!container || !services)
            continue;
        int const bodyEnd = base + kBodyOffset;
        int const entityEnd = bodyEnd + kEntityOffset;
        if (id.Length() < bodyEnd)
            continue;
        entity.SetId(id[id.Length() >= entityEnd ? entityEnd - 1 : bodyEnd - 1]);
        entity.SetParentId(id[bodyEnd - 1]);
        unsigned long const entityId = entity.GetId();
        if (services->ConvertToEntity(entityId, container, entity))
            return true;
    }
    return false;
}

bool TarvexRenderer::ConvertToHighlight(RenderId const& id, RenderId*& ids, int& count) {
    if (isPMIPath(id)) {
        bool result = false;
        for (auto const& [reference, renderer] : m_pmiRenderers) {
            if (!renderer)
                continue;
            result = renderer->ConvertToHighlight(id, ids, count);
            if (result)
                break;
        }
        return result;
    }
    int const length = id.Length();
    if (m_multipleRoots) {
        if (length < kShortestPartPick)
            return handOver(id, ids, count);
        EntityId key;
        RenderId path;
        if (m_linkMap.FindLongestPrefix(id, key, path))
            return handOver(path, ids, count);
        RenderId shortened = head(id, length - kTagsBelowInstance);
        shortened.SetLeading(1);
        return handOver(shortened, ids, count);
    }
    if (length == kPartPickLength)
        return convertToHighlightPart(id, ids, count);
    auto const& tags = id.GetTags();
    auto const geometry = std::find(tags.begin(), tags.end(), KolbaVizCore::Vis);
    if (geometry == tags.end())
        return handOver(id, ids, count);
    // The body below the "Geometry" node; a pick on that node itself names it twice.
    int const index = static_cast<int>(geometry - tags.begin());
    RenderId body = head(id, index + 1);
    body.AddValue(index + 1 < length ? id[index + 1]
                                     : static_cast<std::uint32_t>(KolbaVizCore::Vis));
    body.SetLeading(1);
    return handOver(body, ids, count);
}

bool TarvexRenderer::convertToHighlightPart(RenderId const& id, RenderId*& ids, int& count) {
    constexpr int kGeometryIndex = 5;
    if (id[kGeometryIndex] == KolbaVizCore::Vis) {
        RenderId body = head(id, kGeometryIndex + 1);
        body.SetLeading(1);
        return handOver(body, ids, count);
    }
    return handOver(head(id, kGeometryIndex + 2), ids, count);
}

WString TarvexRenderer::GetToolTip(RenderId const& id) {
    EntityId entity;
    if (!Convert(id, entity))
        return WString();
    std::uint32_t const type = entity.GetType();
    WString text;
    if (type >= KolbaVizCore::UnknownPMI && type <= KolbaVizCore::Roughness) {
        for (auto const& [reference, renderer] : m_pmiRenderers) {
            if (renderer)
                text = renderer->GetToolTip(id);
            if (!text.empty())
                return text;
        }
    }
    if (type == KolbaVizCore::Vertex || type == KolbaVizCore::Edge || type == KolbaVizCore::Face) {
        // The word names what the numbers are; the format opens with the blank behind it.
        text = typeWord(type) + VizPort::FormatW(kToolTipBufferSize,
                                                 u" with ID: %d\nParent Body ID: %d",
                                                 {static_cast<int>(entity.GetId()),
                                                  static_cast<int>(entity.GetParentId())});
    }
    return text;
}

} // namespace VizBridgeTarvex
