#include <VizBridge/render/AVizRenderer.h>

#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/EntityContext.h>
#include <VizBridge/contracts/kolba/EntityTypeContext.h>
#include <VizBridge/contracts/kolba/GeometryItem.h>
#include <VizBridge/contracts/kolba/Node.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/kolba/TriangleType.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizPoints.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/platform/FormatW.h>
#include <VizBridge/services/UniqueServices.h>

#include <cmath>
#include <cstdint>
#include <new>

namespace VizBridgeTarvex {

using KolbaVizCore::EntityContext;
using KolbaVizCore::EntityTypeContext;
using KolbaVizCore::GeometryItem;
using KolbaVizCore::Node;
using KolbaVizCore::SceneLevelContext;

namespace {

constexpr std::size_t kTagNameBufferSize = 32;

} // namespace

AVizRenderer::AVizRenderer(KolbaVizCore::SceneBuilder* builder, VizModelerServices* services)
    : ARenderer(builder, nullptr), m_rendererServices(CloneUnique(services)) {}

AVizRenderer::AVizRenderer(AVizRenderer const& other)
    : ARenderer(other),
      m_geometryBox(other.m_geometryBox), m_geometryCenter{other.m_geometryCenter[0],
                                                           other.m_geometryCenter[1],
                                                           other.m_geometryCenter[2]},
      m_geometryRadius(other.m_geometryRadius),
      m_rendererServices(CloneUnique(other.m_rendererServices.get())), m_nextTag(other.m_nextTag) {}

AVizRenderer& AVizRenderer::operator=(AVizRenderer const& other) {
    if (this == &other)
        return *this;
    ARenderer::operator=(other);
    m_geometryBox = other.m_geometryBox;
    for (int i = 0; i < 3; ++i)
        m_geometryCenter[i] = other.m_geometryCenter[i];
    m_geometryRadius = other.m_geometryRadius;
    m_rendererServices = CloneUnique(other.m_rendererServices.get());
    m_nextTag = other.m_nextTag;
    return *this;
}

AVizRenderer::~AVizRenderer() = default;

void AVizRenderer::GetGeometryCenter(float* const center) const {
    for (int i = 0; i < 3; ++i)
        center[i] = m_geometryCenter[i];
}

float AVizRenderer::GetGeometryRadius() const {
    return m_geometryRadius;
}

bool AVizRenderer::updateExtentsFromBox() {
    if (m_geometryBox.IsEmpty())
        return false;
    double center[3];
    m_geometryBox.GetCenter(center);
    double const* const high = m_geometryBox.GetHigh();
    double squared = 0.0;
    for (int axis = 0; axis < 3; ++axis) {
        m_geometryCenter[axis] = static_cast<float>(center[axis]);
        squared += (high[axis] - center[axis]) * (high[axis] - center[axis]);
    }
    m_geometryRadius = static_cast<float>(std::sqrt(squared)) / 2.0f;
    return true;
}

void AVizRenderer::GetGeometryBox(float* const box) const {
    for (int i = 0; i < 3; ++i) {
        box[i] = static_cast<float>(m_geometryBox.GetLow()[i]);
        box[3 + i] = static_cast<float>(m_geometryBox.GetHigh()[i]);
    }
}

void AVizRenderer::clearBase() {
    m_geometryBox = VizBox();
}

unsigned long AVizRenderer::getNextTag() {
    return m_nextTag++;
}

void AVizRenderer::makeNameFromTag(unsigned long const& tag, WString& out) {
    out = VizPort::FormatW(kTagNameBufferSize, u"%lu", {tag});
}

void AVizRenderer::applyTransform(VizTransf const& t) {
    double matrix[16];
    t.AsArray(matrix);
    if (auto* const builder = getSceneBuilder())
        builder->SetCurrentTransform(matrix);
}

void AVizRenderer::expandBBox(unsigned int count, float const* points, VizBox& box) {
    for (unsigned int i = 0; i < count; ++i) {
        double const point[3] = {points[3 * i], points[3 * i + 1], points[3 * i + 2]};
        box.Add(point);
    }
}

bool AVizRenderer::getVizColor(VizElement const& element, RGBAColor& color) {
    if (!element.HasColor())
        return false;
    color = element.GetColor();
    return true;
}

void AVizRenderer::renderVizMesh(KolbaVizCore::VizMesh const& mesh, VizBox& box, int alpha) {
    auto* const builder = getSceneBuilder();
    if (!builder)
        return;
    {
        EntityTypeContext const faces(builder, EntityType::Face, u"MeshFaces");
        if (faces.IsOK()) {
            for (auto const* face : mesh.GetFaces()) {
                if (!face)
                    continue;
                RGBAColor color = builder->GetRenderingOptions().GetDefaultFaceColor();
                bool const hasColor = getVizColor(*face, color);
                if (alpha > 0)
                    color.alpha = static_cast<std::uint8_t>(alpha & 0xFF);
                EntityContext const entity(builder, 1, u"MeshGeometry", hasColor, color);
                if (entity.IsOK())
                    renderVizFace(*face, box, color);
            }
        }
    }
    {
        EntityTypeContext const edges(builder, EntityType::Edge, u"MeshEdges");
        if (edges.IsOK()) {
            for (auto const* edge : mesh.GetEdges()) {
                if (!edge)
                    continue;
                RGBAColor color = builder->GetRenderingOptions().GetDefaultEdgeColor();
                bool const hasColor = getVizColor(*edge, color);
                EntityContext const entity(builder, 2, u"MeshGeometry", hasColor, color);
                if (entity.IsOK())
                    renderVizEdge(*edge, box, color);
            }
        }
    }
    bool const hidden = mesh.GetHidden();
    builder->SetVisibility(!hidden);
}

void AVizRenderer::renderVizWire(KolbaVizCore::VizWire const& wire, VizBox& box) {
    auto* const builder = getSceneBuilder();
    if (!builder)
        return;
    std::uint32_t const id = Node::GetNextId();
    for (auto const* edge : wire.GetEdges()) {
        if (!edge)
            continue;
        RGBAColor color = builder->GetRenderingOptions().GetDefaultEdgeColor();
        bool const hasColor = getVizColor(*edge, color);
        EntityContext const entity(builder, id, u"WireEdge", hasColor, color);
        if (entity.IsOK())
            renderVizEdge(*edge, box, color);
    }
    builder->SetVisibility(!wire.GetHidden());
}

void AVizRenderer::renderVizPointSet(KolbaVizCore::VizPointSet const& set, VizBox& box) {
    auto* const builder = getSceneBuilder();
    if (!builder)
        return;
    std::uint32_t const id = Node::GetNextId();
    for (auto const* points : set.GetPointSets()) {
        if (!points)
            continue;
        RGBAColor color = builder->GetRenderingOptions().GetDefaultEdgeColor();
        bool const hasColor = getVizColor(*points, color);
        EntityContext const entity(builder, id, u"Points", hasColor, color);
        if (entity.IsOK())
            renderVizPoints(*points, box, color);
    }
    builder->SetVisibility(!set.GetHidden());
}

void AVizRenderer::renderVizFace(KolbaVizCore::VizFace const& face, VizBox& box,
                                 RGBAColor const& color) {
    std::vector<float> const& vertices = face.GetVertices();
    std::vector<float> const& normals = face.GetNormals();
    expandBBox(static_cast<unsigned int>(vertices.size() / 3), vertices.data(), box);
    for (auto const* polygon : face.GetPolygons()) {
        if (polygon)
            renderVizPolygon(*polygon, vertices, normals, color);
    }
}

void AVizRenderer::renderVizPolygon(KolbaVizCore::VizPolygon const& polygon,
                                    std::vector<float> const& vertices,
                                    std::vector<float> const& normals, RGBAColor const& color) {
    int const type = polygon.GetPolygonType();
    std::vector<int> const& indices = polygon.GetIndices();
    std::size_t const n = indices.size();
    auto* const factory = getGeometryItemFactory();
    if (type == KolbaVizCore::UndefinedTriangles || !factory || n < 3)
        return;

    // The item gets a flat copy of the points the indices name, so its own indices are
    // simply 0, 1, 2, ...; an index out of range (bad data) reads as the origin.
    std::vector<int> flatIndices;
    std::vector<float> flatVertices;
    std::vector<float> flatNormals;
    try {
        flatIndices.resize(n);
        flatVertices.resize(3 * n);
        flatNormals.resize(3 * n);
    } catch (std::bad_alloc const&) {
        return;
    }
    auto const read = [](std::vector<float> const& from, long long at) {
        return at >= 0 && static_cast<std::size_t>(at) < from.size()
                   ? from[static_cast<std::size_t>(at)]
                   : 0.0f;
    };
    for (std::size_t i = 0; i < n; ++i) {
        long long const k = indices[i];
        flatIndices[i] = static_cast<int>(i);
        for (int c = 0; c < 3; ++c) {
            flatVertices[3 * i + c] = read(vertices, k + c);
            flatNormals[3 * i + c] = read(normals, k + c);
        }
    }
    int const mode = type == KolbaVizCore::TriangleStrip || type == KolbaVizCore::TriangleFan
                         ? type
                         : KolbaVizCore::Triangles;
    unsigned long const tag = getNextTag();
    unsigned int const floatCount = static_cast<unsigned int>(3 * n);
    GeometryItem* const item =
        factory->MakePolygon(tag, flatVertices.data(), flatNormals.data(), flatIndices.data(),
                             floatCount, floatCount, static_cast<unsigned int>(n), mode);
    if (item) {
        item->SetColor(color);
        getSceneBuilder()->AddGeometryItem(item); // the builder takes the item over
    }
}

void AVizRenderer::renderVizEdge(KolbaVizCore::VizEdge const& edge, VizBox& box,
                                 RGBAColor const& color) {
    std::vector<float> const& vertices = edge.GetVertices();
    auto* const factory = getGeometryItemFactory();
    if (!factory || vertices.empty())
        return;
    expandBBox(static_cast<unsigned int>(vertices.size() / 3), vertices.data(), box);
    unsigned long const tag = getNextTag();
    unsigned int const floatCount = static_cast<unsigned int>(vertices.size());
    GeometryItem* const item = edge.GetLineType() == KolbaVizCore::VizEdge::LineSegments
                                   ? factory->MakeLineSet(tag, vertices.data(), floatCount)
                                   : factory->MakePolyline(tag, vertices.data(), floatCount);
    if (item) {
        item->SetColor(color);
        getSceneBuilder()->AddGeometryItem(item); // the builder takes the item over
    }
}

void AVizRenderer::renderVizPoints(KolbaVizCore::VizPoints const& points, VizBox& box,
                                   RGBAColor const& color) {
    std::vector<float> const& vertices = points.GetVertices();
    auto* const factory = getGeometryItemFactory();
    if (!factory || vertices.empty())
        return;
    expandBBox(static_cast<unsigned int>(vertices.size() / 3), vertices.data(), box);
    for (std::size_t at = 0; at + 3 <= vertices.size(); at += 3) {
        unsigned long const tag = getNextTag();
        GeometryItem* const item =
            factory->MakePoint(tag, vertices[at], vertices[at + 1], vertices[at + 2]);
        if (item) {
            item->SetColor(color);
            getSceneBuilder()->AddGeometryItem(item); // the builder takes the item over
        }
    }
}

void AVizRenderer::renderVizText(KolbaVizCore::VizText const& text, VizBox&) {
    auto* const builder = getSceneBuilder();
    if (!builder)
        return;
    float const* const anchor = text.GetAnchorPoint();
    float const* const direction = text.GetDirection();
    float const* const normal = text.GetNormal();
    RGBAColor color = builder->GetRenderingOptions().GetDefaultEdgeColor();
    getVizColor(text, color);

    SceneLevelContext const level(builder, Node::GetNextId(), u"Text");
    if (!level.IsOK())
        return;
    builder->SetCurrentColor(color, false);

    // y = normal x direction: the text's up direction in its own plane.
    double const y[3] = {double(normal[1]) * direction[2] - double(normal[2]) * direction[1],
                         double(normal[2]) * direction[0] - double(normal[0]) * direction[2],
                         double(normal[0]) * direction[1] - double(normal[1]) * direction[0]};
    double const rows[3][3] = {{direction[0], direction[1], direction[2]},
                               {y[0], y[1], y[2]},
                               {normal[0], normal[1], normal[2]}};
    double const translation[3] = {anchor[0], anchor[1], anchor[2]};
    applyTransform(VizTransf(rows, translation));

    auto* const factory = getGeometryItemFactory();
    if (!factory)
        return;
    unsigned long const tag = getNextTag();
    GeometryItem* const item = factory->MakeText(tag, text.GetText(), text.GetFontName(), anchor,
                                                 text.GetFontAttrs(), 0.0f);
    if (item) {
        item->SetColor(color);
        builder->AddGeometryItem(item); // the builder takes the item over
    }
}

} // namespace VizBridgeTarvex
