#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredReference.h>
#include <VizBridge/stepinput/StepPart.h>
#include <VizBridge/stepinput/StepReadOptions.h>

#include <TopTools_IndexedDataMapOfShapeListOfShape.hxx>
#include <TopoDS_Edge.hxx>

#include <vector>

namespace VizBridgeStep {

/// Meshes one part with Open CASCADE's BRepMesh and writes what the import library holds of
/// it: the part document's geometry, which the import library's conversion and the reference
/// modeler read, and the visualisation data: one mesh of the part's faces and edges, and its
/// supplemental geometry as constructed wires and point sets.
///
/// Every face and edge keeps the entity id of the part's numbering (StepPart); in the
/// visualisation data its mechanical id is that id as text, and its visual id the reference
/// id, a dot and that id, unique over the whole product.
class StepPartMesher {
public:
    StepPartMesher() = delete;

    /// Gives the number of triangles made.
    static int Mesh(StepPart const& part, StepReadOptions const& options,
                    TarvexAuthoredReference& reference);

    /// The points of `edge` as a polyline, three floats a point: its polygon on a meshed face
    /// around it (from `facesOfEdges`), so that it meets that face's triangles, else its
    /// curve sampled within the deflections. Empty for an edge without a curve.
    static std::vector<float>
    EdgePoints(TopoDS_Edge const& edge,
               TopTools_IndexedDataMapOfShapeListOfShape const& facesOfEdges,
               StepReadOptions const& options);
};

} // namespace VizBridgeStep
