#include <VizBridge/stepinput/OcctBrepRenderer.h>

#include <VizBridge/contracts/kolba/AGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/EntityContext.h>
#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/contracts/kolba/EntityTypeContext.h>
#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/TriangleType.h>
#include <VizBridge/contracts/kolba/VizBox.h>
#include <VizBridge/stepinput/OcctPartContainer.h>
#include <VizBridge/stepinput/StepPartMesher.h>

#include <BRepBuilderAPI_Copy.hxx>
#include <BRepMesh_IncrementalMesh.hxx>
#include <BRep_Tool.hxx>
#include <GeomLProp_SLProps.hxx>
#include <Geom_Surface.hxx>
#include <Poly_Triangulation.hxx>
#include <TopExp.hxx>
#include <TopTools_IndexedDataMapOfShapeListOfShape.hxx>
#include <TopoDS.hxx>
#include <TopoDS_Edge.hxx>
#include <TopoDS_Face.hxx>

#include <array>
#include <cstddef>
#include <initializer_list>
#include <optional>
#include <utility>
#include <vector>

namespace VizBridgeStep {

using KolbaVizCore::RenderId;
using KolbaVizCore::RGBAColor;
using KolbaVizCore::SceneBuilder;

namespace {

void addPoint(std::vector<float>& out, gp_XYZ const& point) {
    out.insert(out.end(), {static_cast<float>(point.X()), static_cast<float>(point.Y()),
                           static_cast<float>(point.Z())});
}

/// One face as the item factory wants it: a point and a normal per node, three point numbers
/// a triangle, in the part's coordinates and wound so that the normals face outwards.
struct FaceTriangles {
    std::vector<float> vertices;
    std::vector<float> normals;
    std::vector<int> indices;
};

/// The normal of each node: the surface's where it has one at the node, so that smooth
/// faces shade smoothly; else the mean of the triangles' around the node.
std::vector<gp_Dir> nodeNormals(TopoDS_Face const& face, Poly_Triangulation const& mesh) {
    int const count = mesh.NbNodes();
    std::vector<gp_Dir> normals(static_cast<std::size_t>(count), gp_Dir(0, 0, 1));
    if (mesh.HasNormals()) {
        for (int node = 1; node <= count; ++node)
            normals[node - 1] = mesh.Normal(node);
        return normals;
    }
    std::vector<bool> found(normals.size(), false);
    // The surface without the face's location, which is the mesh's too: its normals are in
    // the frame of the mesh's nodes, and both are placed together by the caller.
    TopLoc_Location surfaceLocation;
    Handle(Geom_Surface) const& surface = BRep_Tool::Surface(face, surfaceLocation);
    if (!surface.IsNull() && mesh.HasUVNodes()) {
        for (int node = 1; node <= count; ++node) {
            gp_Pnt2d const uv = mesh.UVNode(node);
            GeomLProp_SLProps props(surface, uv.X(), uv.Y(), 1, 1e-7);
            if (!props.IsNormalDefined())
                continue;
            normals[node - 1] = props.Normal();
            found[node - 1] = true;
        }
    }
    std::vector<gp_XYZ> sums(normals.size(), gp_XYZ(0, 0, 0));
    for (int i = 1; i <= mesh.NbTriangles(); ++i) {
        int a = 0, b = 0, c = 0;
        mesh.Triangle(i).Get(a, b, c);
        gp_XYZ const pa = mesh.Node(a).XYZ();
        gp_XYZ const normal = (mesh.Node(b).XYZ() - pa).Crossed(mesh.Node(c).XYZ() - pa);
        for (int const node : {a, b, c})
            sums[node - 1] += normal; // weighted by the triangle's area
    }
    for (std::size_t node = 0; node < normals.size(); ++node) {
        if (!found[node] && sums[node].Modulus() > 1e-12)
            normals[node] = gp_Dir(sums[node]);
    }
    return normals;
}

FaceTriangles trianglesOf(TopoDS_Face const& face, Poly_Triangulation const& mesh,
                          TopLoc_Location const& location) {
    FaceTriangles out;
    gp_Trsf const trsf = location.Transformation();
    bool const reversed = face.Orientation() == TopAbs_REVERSED;
    std::vector<gp_Dir> const normals = nodeNormals(face, mesh);
    out.vertices.reserve(3 * normals.size());
    out.normals.reserve(3 * normals.size());
    for (int node = 1; node <= mesh.NbNodes(); ++node) {
        addPoint(out.vertices, mesh.Node(node).Transformed(trsf).XYZ());
        gp_Dir normal = normals[node - 1].Transformed(trsf);
        if (reversed)
            normal.Reverse();
        addPoint(out.normals, normal.XYZ());
    }
    out.indices.reserve(3 * static_cast<std::size_t>(mesh.NbTriangles()));
    for (int i = 1; i <= mesh.NbTriangles(); ++i) {
        int a = 0, b = 0, c = 0;
        mesh.Triangle(i).Get(a, b, c);
        if (reversed)
            std::swap(b, c);
        out.indices.insert(out.indices.end(), {a - 1, b - 1, c - 1});
    }
    return out;
}

/// The face's triangles; a face that the document's meshing left without any is meshed
/// again, on a copy: the document is shared, and other renderers read it as it was read.
FaceTriangles meshOf(TopoDS_Face const& face, StepReadOptions const& options) {
    TopLoc_Location location;
    Handle(Poly_Triangulation) const mesh = BRep_Tool::Triangulation(face, location);
    if (!mesh.IsNull() && mesh->NbTriangles() > 0)
        return trianglesOf(face, *mesh, location);
    TopoDS_Face const copy = TopoDS::Face(BRepBuilderAPI_Copy(face, true, false).Shape());
    BRepMesh_IncrementalMesh const mesher(copy, options.linearDeflection, false,
                                          options.angularDeflection, false);
    Handle(Poly_Triangulation) const again = BRep_Tool::Triangulation(copy, location);
    if (again.IsNull() || again->NbTriangles() == 0)
        return {};
    return trianglesOf(copy, *again, location);
}

RGBAColor opaque(std::array<std::uint8_t, 3> const& rgb) {
    return RGBAColor(rgb[0], rgb[1], rgb[2], 255);
}

} // namespace

OcctBrepRenderer::OcctBrepRenderer(OcctPartContainer const& container, SceneBuilder& builder,
                                   RenderId current)
    : BrepPartRenderer(builder, std::move(current)), m_container(&container) {}

OcctBrepRenderer::~OcctBrepRenderer() = default;

void OcctBrepRenderer::drawFaces(SceneBuilder& builder) const {
    StepPart const& part = m_container->GetPart();
    if (part.faces.IsEmpty())
        return;
    KolbaVizCore::EntityTypeContext const faces(&builder, KolbaVizCore::Face, u"Faces");
    if (!faces.IsOK())
        return;
    KolbaVizCore::AGeometryItemFactory* const factory = getGeometryItemFactory();
    for (int index = 1; index <= part.faces.Extent(); ++index) {
        auto const id = static_cast<std::uint32_t>(index);
        std::optional<std::array<std::uint8_t, 3>> rgb = part.color;
        if (auto const own = part.faceColors.find(index); own != part.faceColors.end())
            rgb = own->second;
        KolbaVizCore::EntityContext const entity(&builder, id, numbered("Face", id),
                                                 rgb.has_value(), rgb ? opaque(*rgb) : RGBAColor());
        if (!entity.IsOK() || factory == nullptr)
            continue;
        FaceTriangles const mesh =
            meshOf(TopoDS::Face(part.faces(index)), m_container->GetOptions());
        // A face without triangles is refused by the factory and keeps an empty node.
        builder.AddGeometryItem(factory->MakePolygon(
            id, mesh.vertices.data(), mesh.normals.data(), mesh.indices.data(),
            static_cast<unsigned int>(mesh.vertices.size()),
            static_cast<unsigned int>(mesh.normals.size()),
            static_cast<unsigned int>(mesh.indices.size()), KolbaVizCore::Triangles));
    }
}

void OcctBrepRenderer::drawEdges(SceneBuilder& builder) const {
    StepPart const& part = m_container->GetPart();
    std::vector<int> drawn;
    for (int index = 1; index <= part.edges.Extent(); ++index) {
        if (m_container->HasEdge(part.EdgeId(index)))
            drawn.push_back(index);
    }
    if (drawn.empty())
        return;
    KolbaVizCore::EntityTypeContext const edges(&builder, KolbaVizCore::Edge, u"Edges");
    if (!edges.IsOK())
        return;
    KolbaVizCore::AGeometryItemFactory* const factory = getGeometryItemFactory();
    TopTools_IndexedDataMapOfShapeListOfShape facesOfEdges;
    TopExp::MapShapesAndAncestors(part.shape, TopAbs_EDGE, TopAbs_FACE, facesOfEdges);
    for (int const index : drawn) {
        std::uint32_t const id = part.EdgeId(index);
        KolbaVizCore::EntityContext const entity(&builder, id, numbered("Edge", id), false, {});
        if (!entity.IsOK() || factory == nullptr)
            continue;
        std::vector<float> const points = StepPartMesher::EdgePoints(
            TopoDS::Edge(part.edges(index)), facesOfEdges, m_container->GetOptions());
        // An edge of fewer than two points is refused by the factory and keeps an empty node.
        builder.AddGeometryItem(
            factory->MakePolyline(id, points.data(), static_cast<unsigned int>(points.size())));
    }
}

std::uint32_t OcctBrepRenderer::bodyTag() const {
    return static_cast<std::uint32_t>(m_container->GetRefID());
}

bool OcctBrepRenderer::hasEntity(std::uint32_t type, std::uint32_t id) const {
    return (type == KolbaVizCore::Face && m_container->HasFace(id)) ||
           (type == KolbaVizCore::Edge && m_container->HasEdge(id));
}

KolbaVizCore::VizBox OcctBrepRenderer::partBox() const {
    return m_container->GetBox();
}

} // namespace VizBridgeStep
