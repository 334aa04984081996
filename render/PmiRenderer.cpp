#include <VizBridge/render/PmiRenderer.h>

#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/AView3DAdapter.h>
#include <VizBridge/contracts/kolba/BodyContext.h>
#include <VizBridge/contracts/kolba/EntityContext.h>
#include <VizBridge/contracts/kolba/EntityTypeContext.h>
#include <VizBridge/contracts/kolba/IView3D.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/platform/DebugOutput.h>
#include <VizBridge/contracts/platform/FormatW.h>

#include <algorithm>
#include <cmath>
#include <memory>
#include <string>

namespace VizBridgeTarvex {

using KolbaVizCore::EntityType;
using KolbaVizCore::SceneBuilder;
using KolbaVizCore::SceneLevelContext;

namespace {

constexpr unsigned long kNoOwner = 0xFFFFFFFFu;
/// The viewer option that FTA meshes ask for; what it does is the viewer's affair.
constexpr int kFTAMeshViewOption = 1;
/// FTA meshes are drawn half transparent.
constexpr int kFTAMeshAlpha = 128;
constexpr unsigned int kPlaneRectangleFloats = 15;
constexpr std::size_t kRefLineBufferSize = 1024;

WString widened(std::string const& narrow) {
    return WString(narrow.begin(), narrow.end());
}

bool isTopTag(std::uint32_t tag) {
    return tag == KolbaVizCore::PMI || tag == KolbaVizCore::Views || tag == KolbaVizCore::Captures;
}

EntityType typeFromTag(std::uint32_t tag) {
    return KolbaVizCore::EntityId::GetTypeFromInt(tag);
}

} // namespace

PmiRenderer::PmiRenderer(KolbaVizCore::VizPMIContainer* container, KolbaVizCore::ARenderer* owner,
                         SceneBuilder* builder, VizModelerServices* services,
                         bool const& ownerPathsComplete)
    : AVizRenderer(builder, services), m_pmiContainer(container), m_ownerRenderer(owner),
      m_ownerPathsComplete(ownerPathsComplete) {}

PmiRenderer::~PmiRenderer() {
    m_pmiContainer = nullptr;
}

void PmiRenderer::AddOwnerReference(unsigned long const& tag) {
    m_ownerReferences.push_back(static_cast<std::uint32_t>(tag));
}

bool PmiRenderer::Render() {
    if (!preRender())
        return false;
    setRenderId(renderPMI());
    m_viewsRenderId = renderViews();
    m_capturesRenderId = renderCaptures();
    postRender();
    return true;
}

void PmiRenderer::ClearAll() {
    forgetDrawing();
    clearBase();
}

bool PmiRenderer::preRender() {
    forgetDrawing();
    m_geometryBox = VizBox();
    return true;
}

void PmiRenderer::forgetDrawing() {
    for (RenderId* const drawn : {&m_capturesRenderId, &m_viewsRenderId}) {
        if (drawn->IsEmpty())
            continue;
        if (SceneBuilder* const builder = getSceneBuilder())
            builder->RemoveNode(*drawn);
        drawn->Clear();
    }
    m_pmiElements.clear();
    m_viewElements.clear();
    m_captureElements.clear();
    m_ownerReferences.clear();
}

void PmiRenderer::postRender() {
    updateExtentsFromBox();
}

RenderId PmiRenderer::renderPMI() {
    SceneBuilder* const builder = getSceneBuilder();
    if (!m_pmiContainer || !builder)
        return RenderId();
    KolbaVizCore::EntityTypeContext const top(builder, KolbaVizCore::PMI, u"PMI");
    if (!top.IsOK())
        return RenderId();
    RenderId path;
    if (builder->GetCurrentRenderId(path) && path.Length() > 1)
        AddOwnerReference(path[path.Length() - 2]); // the node the drawing shows under

    double const scale = m_pmiContainer->GetScaleFactor();
    bool scaled = false;
    VizTransf transformation;
    if (scale != 1.0 && std::fabs(scale) > 1e-5) {
        transformation = VizTransf(scale);
        scaled = true;
    }

    for (KolbaVizCore::VizPMI* const pmi : m_pmiContainer->GetVizPMIs()) {
        if (!pmi)
            continue;
        KolbaVizCore::VizPMIType const group = pmi->GetGroupType();
        EntityType const groupType = group.GetEntityType();
        SceneLevelContext const level(builder, groupType, widened(group.GetName()));
        if (!level.IsOK())
            continue;
        RenderId groupPath;
        // The last object of a group stands for the group's node.
        if (builder->GetCurrentRenderId(groupPath))
            m_pmiElements[EntityId(groupType, groupType, groupType)] = pmi;
        renderVizPMI(*pmi, m_geometryBox, transformation);
    }

    std::vector<KolbaVizCore::VizMesh*> const& meshes = m_pmiContainer->GetVizFTACGMeshes();
    std::vector<KolbaVizCore::VizWire*> const& wires = m_pmiContainer->GetVizFTACGWires();
    std::vector<KolbaVizCore::VizPointSet*> const& sets = m_pmiContainer->GetVizFTACGPointSets();
    if (!meshes.empty() || !wires.empty() || !sets.empty()) {
        KolbaVizCore::EntityTypeContext const fta(builder, KolbaVizCore::FTAGeometry,
                                                  u"FTAGeometry");
        if (fta.IsOK()) {
            // Opens the body node of one FTA element, records it and lets `draw` fill it.
            auto const body = [&](VizElement& element, char16_t const* name, bool isMesh,
                                  auto const& draw) {
                KolbaVizCore::BodyContext const context(
                    builder, static_cast<std::uint32_t>(element.GetID()), name);
                if (!context.IsOK())
                    return;
                if (isMesh) {
                    if (KolbaVizCore::AView3DAdapter* const adapter = builder->GetView3DAdapter())
                        if (KolbaVizCore::IView3D* const view = adapter->GetView3D())
                            view->SetViewOption(kFTAMeshViewOption);
                }
                if (scaled)
                    applyTransform(transformation);
                recordAtCurrentPath(element, m_pmiElements);
                draw();
            };
            for (KolbaVizCore::VizMesh* const mesh : meshes)
                if (mesh)
                    body(*mesh, u"Mesh", true,
                         [&] { renderVizMesh(*mesh, m_geometryBox, kFTAMeshAlpha); });
            for (KolbaVizCore::VizWire* const wire : wires)
                if (wire)
                    body(*wire, u"Wire", false, [&] { renderVizWire(*wire, m_geometryBox); });
            for (KolbaVizCore::VizPointSet* const set : sets)
                if (set)
                    body(*set, u"PointSet", false, [&] { renderVizPointSet(*set, m_geometryBox); });
        }
    }
    // The box was gathered unscaled; it takes the scale whatever the nodes hold.
    m_geometryBox.Scale(scale);
    return path;
}

void PmiRenderer::renderVizPMI(KolbaVizCore::VizPMI& pmi, VizBox& box,
                               VizTransf const& transformation) {
    SceneBuilder* const builder = getSceneBuilder();
    std::vector<KolbaVizCore::VizEdge*> const& edges = pmi.GetEdges();
    std::vector<KolbaVizCore::VizFace*> const& faces = pmi.GetFaces();
    std::vector<KolbaVizCore::VizText*> const& texts = pmi.GetTexts();
    SceneLevelContext const object(builder, static_cast<std::uint32_t>(pmi.GetID()),
                                   widened(pmi.GetType().GetName()));
    if (!object.IsOK())
        return;
    recordAtCurrentPath(pmi, m_pmiElements);
    // Always, so that every PMI object node holds a placement, the identity without scale.
    applyTransform(transformation);

    KolbaVizCore::RenderingOptions const& options = builder->GetRenderingOptions();
    renderPieces(edges, KolbaVizCore::Edge, u"PMI Edges", u"PMI Edge",
                 options.GetDefaultEdgeColor(),
                 [&](KolbaVizCore::VizEdge const& edge, RGBAColor const& color) {
                     renderVizEdge(edge, box, color);
                 });
    renderPieces(faces, KolbaVizCore::Face, u"PMI Faces", u"PMI Face",
                 options.GetDefaultFaceColor(),
                 [&](KolbaVizCore::VizFace const& face, RGBAColor const& color) {
                     renderVizFace(face, box, color);
                 });
    if (!texts.empty()) {
        SceneLevelContext const level(builder, KolbaVizCore::Text, u"PMI Text Objects");
        if (level.IsOK()) {
            for (KolbaVizCore::VizText* const text : texts)
                if (text)
                    renderVizText(*text, box);
        }
    }
    if (pmi.GetHidden())
        builder->SetVisibility(false);
}

template <typename Piece, typename Draw>
void PmiRenderer::renderPieces(std::vector<Piece*> const& pieces, EntityType const type,
                               char16_t const* levelName, char16_t const* pieceName,
                               RGBAColor const& defaultColor, Draw const& draw) {
    if (pieces.empty())
        return;
    SceneBuilder* const builder = getSceneBuilder();
    SceneLevelContext const level(builder, type, levelName);
    if (!level.IsOK())
        return;
    for (Piece* const piece : pieces) {
        if (!piece)
            continue;
        RGBAColor color = defaultColor;
        bool const own = getVizColor(*piece, color);
        KolbaVizCore::EntityContext const context(
            builder, static_cast<std::uint32_t>(piece->GetID()), pieceName, own, color);
        if (context.IsOK())
            draw(*piece, color);
    }
}

RenderId PmiRenderer::renderViews() {
    if (!m_pmiContainer)
        return RenderId();
    return renderCollections(KolbaVizCore::Views, u"Views", m_pmiContainer->GetViews(),
                             m_viewElements);
}

RenderId PmiRenderer::renderCaptures() {
    if (!m_pmiContainer)
        return RenderId();
    return renderCollections(KolbaVizCore::Captures, u"Captures", m_pmiContainer->GetCaptures(),
                             m_captureElements);
}

template <typename Collection>
RenderId PmiRenderer::renderCollections(EntityType const type, char16_t const* name,
                                        std::vector<Collection*> const& collections,
                                        std::map<EntityId, VizElement const*>& map) {
    SceneBuilder* const builder = getSceneBuilder();
    if (!builder)
        return RenderId();
    RenderId result;
    KolbaVizCore::EntityTypeContext const top(builder, type, name);
    if (!top.IsOK())
        return RenderId();
    builder->GetCurrentRenderId(result);
    for (Collection* const collection : collections) {
        if (!collection)
            continue;
        RenderId path;
        // The last view or capture stands for the whole node.
        if (builder->GetCurrentRenderId(path))
            map[EntityId(type, type, type)] = collection;
        // Complete by now: renderPMI has recorded every PMI object.
        collection->SetEntityMap(m_pmiElements);
        SceneLevelContext const level(builder, static_cast<std::uint32_t>(collection->GetID()),
                                      collection->GetName());
        if (!level.IsOK() || !builder->GetCurrentRenderId(path))
            continue;
        if (collection->GetHidden())
            builder->SetVisibility(false);
        collection->Set3DRenderID(path);
        EntityId entity;
        if (!Convert(path, entity))
            entity = EntityId(type, type, static_cast<std::uint32_t>(collection->GetID()));
        map[entity] = collection;
        collection->SetEntityID(entity);
        renderVizViewCap(*collection);
    }
    return result;
}

void PmiRenderer::renderVizViewCap(KolbaVizCore::VizPMICollection& collection) {
    float const* const plane = collection.GetPlaneRectangle();
    if (!plane)
        return;
    SceneBuilder* const builder = getSceneBuilder();
    auto const tag = static_cast<std::uint32_t>(collection.GetID() + 1);
    SceneLevelContext const level(builder, tag, u"Plane Rectangle");
    if (!level.IsOK())
        return;
    builder->SetLineStyle("dashed", -1.0f);
    builder->SetCurrentColor(RGBAColor(255, 255, 255, 255), false);
    if (KolbaVizCore::AGeometryItemFactory* const factory = getGeometryItemFactory()) {
        if (KolbaVizCore::GeometryItem* const item =
                factory->MakePolyline(tag, plane, kPlaneRectangleFloats))
            builder->AddGeometryItem(item); // the builder takes the item over
    }
}

void PmiRenderer::recordAtCurrentPath(VizElement& element,
                                      std::map<EntityId, VizElement const*>& map) {
    RenderId path;
    if (!getSceneBuilder()->GetCurrentRenderId(path))
        return;
    element.Set3DRenderID(path);
    EntityId entity;
    if (!Convert(path, entity))
        return;
    map[entity] = &element;
    element.SetEntityID(entity);
}

bool PmiRenderer::isOwned(unsigned long const& tag) {
    return std::find(m_ownerReferences.begin(), m_ownerReferences.end(),
                     static_cast<std::uint32_t>(tag)) != m_ownerReferences.end();
}

bool PmiRenderer::isOwned(RenderId const& id, unsigned long& owner) {
    owner = kNoOwner;
    for (int i = 1; i < id.Length(); ++i) {
        if (isTopTag(id[i]) && isOwned(id[i - 1])) {
            owner = id[i - 1];
            return true;
        }
    }
    return false;
}

bool PmiRenderer::Convert(RenderId const& id, EntityId& entity) {
    unsigned long owner = kNoOwner;
    if (!isOwned(id, owner))
        return false;
    entity = EntityId();
    int const n = id.Length();
    int const last = lastPMITag(id);
    auto const set = [&entity](std::uint32_t parent, std::uint32_t type, std::uint32_t value) {
        entity = EntityId(parent, type, value);
        return true;
    };
    if (id[last] == KolbaVizCore::PMI && last > 1 && id[last - 1] == owner) {
        if (last == n - 1)
            return set(KolbaVizCore::PMI, KolbaVizCore::Group, KolbaVizCore::PMI);
        std::uint32_t const group = id[last + 1];
        return set(group, typeFromTag(group), last + 2 < n ? id[last + 2] : group);
    }
    for (int i = last; i < n; ++i) {
        std::uint32_t const tag = id[i];
        if (tag == KolbaVizCore::Views || tag == KolbaVizCore::Captures)
            return set(tag, tag, i + 1 < n ? id[i + 1] : tag);
        if (tag != KolbaVizCore::PMI)
            continue;
        if (i == n - 1)
            return set(KolbaVizCore::PMI, KolbaVizCore::Group, KolbaVizCore::PMI);
        std::uint32_t const next = id[i + 1];
        return set(next, typeFromTag(next), i + 2 < n ? id[i + 2] : next);
    }
    return false;
}

bool PmiRenderer::Convert(EntityId const& entity, RenderId& id) {
    id = RenderId();
    std::map<EntityId, VizElement const*> const* map = &m_pmiElements;
    if (entity.GetType() == KolbaVizCore::Views)
        map = &m_viewElements;
    else if (entity.GetType() == KolbaVizCore::Captures)
        map = &m_captureElements;
    else if (!entity.IsAnnotation())
        return false;
    auto const found = map->find(entity);
    if (found == map->end() || !found->second)
        return false;
    found->second->Get3DRenderID(id);
    bool const summary =
        entity.GetId() == entity.GetParentId() && entity.GetParentId() == entity.GetType();
    if (summary && id.Length() > 2)
        id.SetLength(id.Length() - 1);
    return true;
}

bool PmiRenderer::ConvertToHighlight(RenderId const& id, RenderId*& ids, int& count) {
    for (std::uint32_t const tag : id.GetTags()) {
        if (tag == KolbaVizCore::Views)
            return convertToHighlightView(id, ids, count);
        if (tag == KolbaVizCore::Captures)
            return convertToHighlightCapture(id, ids, count);
        if (tag == KolbaVizCore::PMI)
            return convertToHighlightPMI(id, ids, count);
    }
    return false;
}

bool PmiRenderer::convertToHighlightPMI(RenderId const& id, RenderId*& ids, int& count) {
    unsigned long owner = kNoOwner;
    if (!isOwned(id, owner))
        return false;
    count = 0;
    int const last = lastPMITag(id);
    if (id.Length() >= last + 3) {
        // A pick below the object (an edge, a text) lights up the whole object.
        RenderId object = id;
        object.SetLength(last + 3);
        object.SetLeading(1);
        EntityId entity;
        if (Convert(object, entity)) {
            auto const found = m_pmiElements.find(entity);
            if (found != m_pmiElements.end() && found->second)
                getPMIRenderIDs(id, object, found->second, ids, count);
            if (count != 0)
                return true;
        }
    }
    return handOver({id}, ids, count);
}

void PmiRenderer::getPMIRenderIDs(RenderId const& picked, RenderId const& parent,
                                  VizElement const* element, RenderId*& ids, int& count) {
    if (!element || !m_pmiContainer) {
        handOver({parent}, ids, count);
        return;
    }
    // Constructed geometry has no links: the caller falls back on the picked path.
    if (element->GetElementType() != KolbaVizCore::VizPMI::TypeID())
        return;
    WString const mechanicalId =
        static_cast<KolbaVizCore::VizPMI const*>(element)->GetMechanicalID();
    std::vector<EntityId> entities;
    m_pmiContainer->GetBREPLinks(mechanicalId, entities);
    std::vector<WString> linked;
    m_pmiContainer->GetPMILinks(mechanicalId, linked);

    std::vector<RenderId> paths{parent};
    if (m_ownerRenderer) {
        constexpr int kInstanceHead = 3; // scene top, product, root instance
        for (EntityId const& entity : entities) {
            RenderId own;
            // A linked entity the owner cannot place is left out: a path of the instance
            // alone would light up the whole instance.
            if (!m_ownerRenderer->Convert(entity, own) || own.IsEmpty())
                continue;
            own.SetLeading(1);
            if (m_ownerPathsComplete) {
                paths.push_back(own);
                continue;
            }
            // The owner's path runs from the product's child down: below the picked one.
            RenderId placed(1);
            for (int index = 0; index < std::min(kInstanceHead, picked.Length()); ++index)
                placed.AddValue(picked[index]);
            for (int index = 1; index < own.Length(); ++index)
                placed.AddValue(own[index]);
            paths.push_back(placed);
        }
    }
    for (WString const& pmiId : linked) {
        VizPort::OutputDebugStringW(pmiId.c_str());
        KolbaVizCore::SemanticPMI* record = nullptr;
        RenderId path;
        if (!m_pmiContainer->GetSemanticPMI(pmiId, record))
            continue;
        if (KolbaVizCore::VizPMI const* const other = m_pmiContainer->GetVizPMI(pmiId))
            if (other->Get3DRenderID(path))
                paths.push_back(path);
    }
    handOver(paths, ids, count);
}

bool PmiRenderer::convertToHighlightView(RenderId const& id, RenderId*& ids, int& count) {
    return convertToHighlightCollection(id, m_viewElements, ids, count);
}

bool PmiRenderer::convertToHighlightCapture(RenderId const& id, RenderId*& ids, int& count) {
    return convertToHighlightCollection(id, m_captureElements, ids, count);
}

bool PmiRenderer::convertToHighlightCollection(RenderId const& id,
                                               std::map<EntityId, VizElement const*>& map,
                                               RenderId*& ids, int& count) {
    ids = nullptr;
    count = 0;
    EntityId entity;
    if (!Convert(id, entity))
        return false;
    VizElement const* const element = map[entity]; // an unknown id stays as a null entry
    if (!element)
        return false;
    auto const& collection = static_cast<KolbaVizCore::VizPMICollection const&>(*element);
    RenderId* members = nullptr;
    int memberCount = 0;
    std::vector<RenderId> paths{id};
    if (collection.GetMemberRenderIds(members, memberCount, false)) {
        std::unique_ptr<RenderId[]> const owned(members); // handed to us; freed here
        paths.insert(paths.end(), owned.get(), owned.get() + memberCount);
    }
    return handOver(paths, ids, count);
}

WString PmiRenderer::GetToolTip(RenderId const& id) {
    EntityId entity;
    if (!Convert(id, entity) || !m_pmiContainer)
        return WString();
    WString const reference =
        VizPort::FormatW(kRefLineBufferSize, u"\nRefID : %d\n\n", {m_pmiContainer->GetRefID()});
    std::uint32_t const type = entity.GetType();
    WString text;
    if (type >= KolbaVizCore::UnknownPMI && type <= KolbaVizCore::Roughness) {
        auto const found = m_pmiElements.find(entity);
        VizElement const* const element = found == m_pmiElements.end() ? nullptr : found->second;
        std::string const kind = element ? element->GetElementType() : std::string();
        if (kind == KolbaVizCore::VizPMI::TypeID()) {
            auto const& pmi = static_cast<KolbaVizCore::VizPMI const&>(*element);
            WString const own = pmi.ToString();
            if (!own.empty())
                text = own + reference;
            WString semantic;
            if (m_pmiContainer->GetSemanticPMIAsString(pmi.GetMechanicalID(), semantic))
                text += semantic;
        } else if (kind == KolbaVizCore::VizMesh::TypeID() ||
                   kind == KolbaVizCore::VizWire::TypeID() ||
                   kind == KolbaVizCore::VizPointSet::TypeID()) {
            text +=
                u"Constructed Geometry\nVisualID : " + element->GetVisualID() + u"\n" + reference;
        }
    }
    bool const summary = entity.GetId() == entity.GetParentId() && entity.GetParentId() == type;
    if (type == KolbaVizCore::Captures || type == KolbaVizCore::Views) {
        bool const captures = type == KolbaVizCore::Captures;
        if (summary) {
            text += captures ? u"Captures" : u"Views";
        } else {
            auto const& map = captures ? m_captureElements : m_viewElements;
            auto const found = map.find(entity);
            if (found != map.end() && found->second) {
                WString const own =
                    captures ? static_cast<KolbaVizCore::VizCapture const&>(*found->second)
                                   .GetCaptureAsString()
                             : static_cast<KolbaVizCore::VizView const&>(*found->second)
                                   .GetViewAsString();
                if (!own.empty())
                    text += own + reference;
            }
        }
    }
    return text;
}

int PmiRenderer::lastPMITag(RenderId const& id) {
    int last = 0;
    for (int i = 0; i < id.Length(); ++i)
        if (id[i] == KolbaVizCore::PMI)
            last = i;
    return last;
}

bool PmiRenderer::handOver(std::vector<RenderId> const& paths, RenderId*& ids, int& count) {
    auto array = std::make_unique<RenderId[]>(paths.size());
    std::copy(paths.begin(), paths.end(), array.get());
    ids = array.release(); // the interface makes the array the caller's
    count = static_cast<int>(paths.size());
    return true;
}

} // namespace VizBridgeTarvex
