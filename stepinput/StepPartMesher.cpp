#include <VizBridge/stepinput/StepPartMesher.h>

#include <BRepAdaptor_Curve.hxx>
#include <BRepMesh_IncrementalMesh.hxx>
#include <BRep_Tool.hxx>
#include <GCPnts_TangentialDeflection.hxx>
#include <GeomLProp_SLProps.hxx>
#include <Geom_Surface.hxx>
#include <Poly_PolygonOnTriangulation.hxx>
#include <Poly_Triangulation.hxx>
#include <TopExp.hxx>
#include <TopExp_Explorer.hxx>
#include <TopTools_IndexedDataMapOfShapeListOfShape.hxx>
#include <TopoDS.hxx>
#include <TopoDS_Edge.hxx>
#include <TopoDS_Face.hxx>
#include <TopoDS_Vertex.hxx>

#include <string>

namespace VizBridgeStep {

namespace {

VizPort::WString idText(unsigned int id) {
    return VizPort::Widen(std::to_string(id));
}

void addPoint(std::vector<float>& out, gp_Pnt const& point) {
    out.insert(out.end(), {static_cast<float>(point.X()), static_cast<float>(point.Y()),
                           static_cast<float>(point.Z())});
}

TarvexAuthoredVisuEdge visuEdge(std::vector<float> points, std::optional<VizPort::WString> id) {
    TarvexAuthoredVisuEdge edge;
    edge.mechanicalId = std::move(id);
    std::vector<int> indices(points.size() / 3);
    for (std::size_t i = 0; i < indices.size(); ++i)
        indices[i] = static_cast<int>(3 * i); // an index is the offset of a point's first float
    edge.lineIndices = std::move(indices);
    edge.lineType = TarvexVisuLine_Polyline;
    edge.points = std::move(points);
    return edge;
}

/// One face: vertices, normals and triangles, in the part's coordinates.
int meshFace(StepPart const& part, int index, TarvexAuthoredReference& reference,
             TarvexAuthoredVisuMesh& mesh) {
    TopoDS_Face const face = TopoDS::Face(part.faces(index));
    TopLoc_Location location;
    Handle(Poly_Triangulation) const triangulation = BRep_Tool::Triangulation(face, location);
    if (triangulation.IsNull() || triangulation->NbTriangles() == 0)
        return 0;
    bool const reversed = face.Orientation() == TopAbs_REVERSED;
    // Normals of the surface where it has them, so that smooth faces shade smoothly; else
    // those of the triangles around each node.
    Handle(Geom_Surface) const surface = BRep_Tool::Surface(face);
    bool const onSurface = !surface.IsNull() && triangulation->HasUVNodes();
    if (!onSurface && !triangulation->HasNormals())
        triangulation->ComputeNormals();
    gp_Trsf const trsf = location.Transformation();

    TarvexAuthoredFace brep;
    brep.entityId = static_cast<unsigned int>(index);
    TarvexAuthoredVisuFace visu;
    visu.id = idText(part.referenceId) + u"." + idText(brep.entityId);
    visu.mechanicalId = idText(brep.entityId);
    if (auto const color = part.faceColors.find(index); color != part.faceColors.end())
        visu.rgb =
            std::array<unsigned short, 3>{color->second[0], color->second[1], color->second[2]};
    for (int node = 1; node <= triangulation->NbNodes(); ++node) {
        addPoint(brep.vertices, triangulation->Node(node).Transformed(trsf));
        gp_Dir normal(0, 0, 1);
        if (onSurface) {
            gp_Pnt2d const uv = triangulation->UVNode(node);
            GeomLProp_SLProps props(surface, uv.X(), uv.Y(), 1, 1e-7);
            if (props.IsNormalDefined())
                normal = props.Normal();
        } else {
            normal = triangulation->Normal(node);
        }
        normal.Transform(trsf);
        if (reversed)
            normal.Reverse();
        visu.normals.insert(visu.normals.end(),
                            {static_cast<float>(normal.X()), static_cast<float>(normal.Y()),
                             static_cast<float>(normal.Z())});
    }
    visu.vertices = brep.vertices;
    std::vector<int> offsets;
    offsets.reserve(3 * static_cast<std::size_t>(triangulation->NbTriangles()));
    for (int i = 1; i <= triangulation->NbTriangles(); ++i) {
        int a = 0, b = 0, c = 0;
        triangulation->Triangle(i).Get(a, b, c);
        if (reversed)
            std::swap(b, c);
        for (int const node : {a, b, c}) {
            brep.triangles.push_back(static_cast<unsigned int>(node - 1));
            offsets.push_back(3 * (node - 1));
        }
    }
    visu.polygons.push_back(
        TarvexAuthoredVisuPolygon{std::move(offsets), TarvexVisuPolygon_Triangles});
    reference.geometry.faces.push_back(std::move(brep));
    mesh.faces.push_back(std::move(visu));
    return triangulation->NbTriangles();
}

} // namespace

std::vector<float>
StepPartMesher::EdgePoints(TopoDS_Edge const& edge,
                           TopTools_IndexedDataMapOfShapeListOfShape const& facesOfEdges,
                           StepReadOptions const& options) {
    std::vector<float> points;
    if (int const index = facesOfEdges.FindIndex(edge)) {
        for (TopoDS_Shape const& face : facesOfEdges(index)) {
            TopLoc_Location location;
            Handle(Poly_Triangulation) const mesh =
                BRep_Tool::Triangulation(TopoDS::Face(face), location);
            if (mesh.IsNull())
                continue;
            Handle(Poly_PolygonOnTriangulation) const polygon =
                BRep_Tool::PolygonOnTriangulation(edge, mesh, location);
            if (polygon.IsNull())
                continue;
            for (int node = 1; node <= polygon->NbNodes(); ++node)
                addPoint(points, mesh->Node(polygon->Node(node)).Transformed(location));
            return points;
        }
    }
    if (!BRep_Tool::IsGeometric(edge))
        return points;
    BRepAdaptor_Curve const curve(edge);
    GCPnts_TangentialDeflection const sampled(curve, options.angularDeflection,
                                              options.linearDeflection);
    for (int i = 1; i <= sampled.NbPoints(); ++i)
        addPoint(points, sampled.Value(i));
    return points;
}

int StepPartMesher::Mesh(StepPart const& part, StepReadOptions const& options,
                         TarvexAuthoredReference& reference) {
    reference.visu.unit = TarvexLengthUnit_Millimeter; // Open CASCADE gives the geometry in mm
    int triangles = 0;
    if (!part.shape.IsNull()) {
        BRepMesh_IncrementalMesh const mesher(part.shape, options.linearDeflection, false,
                                              options.angularDeflection, options.parallelMeshing);
        TarvexAuthoredVisuNode& node = reference.visu.nodes.emplace_back();
        node.type = TarvexVisuNode::VisuMesh;
        if (part.color)
            node.attributes.rgb =
                std::array<unsigned short, 3>{(*part.color)[0], (*part.color)[1], (*part.color)[2]};
        node.mesh.id = idText(part.referenceId);
        node.mesh.mechanicalId = idText(part.referenceId);
        for (int index = 1; index <= part.faces.Extent(); ++index)
            triangles += meshFace(part, index, reference, node.mesh);

        TopTools_IndexedDataMapOfShapeListOfShape facesOfEdges;
        TopExp::MapShapesAndAncestors(part.shape, TopAbs_EDGE, TopAbs_FACE, facesOfEdges);
        for (int index = 1; index <= part.edges.Extent(); ++index) {
            TopoDS_Edge const edge = TopoDS::Edge(part.edges(index));
            if (BRep_Tool::Degenerated(edge))
                continue;
            std::vector<float> points = EdgePoints(edge, facesOfEdges, options);
            if (points.size() < 6)
                continue;
            unsigned int const id = part.EdgeId(index);
            reference.geometry.edges.push_back(TarvexAuthoredEdge{id, points});
            node.mesh.edges.push_back(visuEdge(std::move(points), idText(id)));
        }
    }
    if (!part.supplemental.IsNull()) {
        TopTools_IndexedDataMapOfShapeListOfShape none;
        TarvexAuthoredVisuNode wires;
        wires.type = TarvexVisuNode::VisuWire;
        wires.wire.geometryType = TarvexVisuGeometry_Constructed;
        for (TopExp_Explorer edge(part.supplemental, TopAbs_EDGE); edge.More(); edge.Next()) {
            std::vector<float> points = EdgePoints(TopoDS::Edge(edge.Current()), none, options);
            if (points.size() >= 6)
                wires.wire.edges.push_back(visuEdge(std::move(points), std::nullopt));
        }
        TarvexAuthoredVisuNode points;
        points.type = TarvexVisuNode::VisuPointSet;
        points.pointSet.geometryType = TarvexVisuGeometry_Constructed;
        TarvexAuthoredVisuPoints loose;
        loose.pointIndices.emplace();
        for (TopExp_Explorer vertex(part.supplemental, TopAbs_VERTEX, TopAbs_EDGE); vertex.More();
             vertex.Next()) {
            loose.pointIndices->push_back(static_cast<int>(loose.points.size()));
            addPoint(loose.points, BRep_Tool::Pnt(TopoDS::Vertex(vertex.Current())));
        }
        if (!wires.wire.edges.empty())
            reference.visu.nodes.push_back(std::move(wires));
        if (!loose.points.empty()) {
            points.pointSet.points.push_back(std::move(loose));
            reference.visu.nodes.push_back(std::move(points));
        }
    }
    return triangles;
}

} // namespace VizBridgeStep
