#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuMesh.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointSet.h>
#include <VizBridge/contracts/tarvex/TarvexVisuWire.h>

#include <memory>

struct TarvexAuthoredVisuNode;

/// One node of the flat node list of visualisation data: its type, whether it is a leaf, its
/// attributes, and, for a leaf, what it shows. A node holds a mesh, a wire, a point set and a
/// PMI; those it was not given are empty. A default object is a non-leaf node of type 0.
class TarvexVisuNode {
public:
    /// Node types. The values are the library's interface: 5, 7 and 9 are geometry, 10 a
    /// PMI of no group, and 12 to 57 PMI in groups, each group led by its own type
    /// (12 notes, 16 datums, 20 dimensions, 33 geometrical tolerances, 56 roughness).
    enum TarvexVisuNodeType : int {
        VisuUnknown = 0,
        VisuRoot = 1,
        VisuGroup = 2,
        VisuInstance = 3,
        VisuBody = 4,
        VisuMesh = 5,
        VisuFace = 6,
        VisuWire = 7,
        VisuEdge = 8,
        VisuPointSet = 9,
        VisuPMI = 10,
        VisuPMIGroup = 11,
        VisuNoteGroup = 12,
        VisuNote = 13,
        VisuFlagNote = 14,
        VisuTextNote = 15,
        VisuDatumGroup = 16,
        VisuDatumFeature = 17,
        VisuDatumTarget = 18,
        VisuDatumReferenceFrame = 19,
        VisuDimensionGroup = 20,
        VisuDimensionDistance = 21,
        VisuDimensionLength = 22,
        VisuDimensionAngle = 23,
        VisuDimensionRadius = 24,
        VisuDimensionDiameter = 25,
        VisuDimensionChamfer = 26,
        VisuDimensionSlope = 27,
        VisuDimensionCoordinate = 28,
        VisuDimensionCurvilinear = 29,
        VisuDimensionOffset = 30,
        VisuDimensionBalloon = 31,
        VisuDimensionOther = 32,
        VisuGeomTolGroup = 33,
        VisuGeomTolStraightness = 34,
        VisuGeomTolFlatness = 35,
        VisuGeomTolCircularity = 36,
        VisuGeomTolCylindricity = 37,
        VisuGeomTolLineProfile = 38,
        VisuGeomTolSurfaceProfile = 39,
        VisuGeomTolAngularity = 40,
        VisuGeomTolPerpendicularity = 41,
        VisuGeomTolParallelism = 42,
        VisuGeomTolPosition = 43,
        VisuGeomTolConcentricity = 44,
        VisuGeomTolCoaxiality = 45,
        VisuGeomTolSymmetry = 46,
        VisuGeomTolCircularRunout = 47,
        VisuGeomTolTotalRunout = 48,
        VisuGeomTolAxisStraightness = 49,
        VisuGeomTolLineProfileDatum = 50,
        VisuGeomTolSurfaceProfileDatum = 51,
        VisuGeomTolCompositePosition = 52,
        VisuGeomTolCompositeProfile = 53,
        VisuGeomTolDatumSystem = 54,
        VisuGeomTolOther = 55,
        VisuRoughnessGroup = 56,
        VisuRoughness = 57,
    };

    TarvexVisuNode() = default;
    TarvexVisuNode(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuNode const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    /// The authored type, which need not be one of the enumerators.
    TarvexVisuNodeType GetType() const;
    bool IsLeaf() const;
    TarvexVisuAttributes GetAttributes() const;
    TarvexVisuMesh GetMesh() const;
    TarvexVisuWire GetWire() const;
    TarvexVisuPointSet GetPointSet() const;
    TarvexVisuPMI GetPMI() const;

    /// The enumerator's name, "VisuMesh" for 5; "VisuUnknown" for a value outside 0 to 57.
    /// Never null; the text lives as long as the program.
    static char const* NodeTypeAsString(TarvexVisuNodeType type);

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuNode const> m_record; ///< shares the import's data
};
