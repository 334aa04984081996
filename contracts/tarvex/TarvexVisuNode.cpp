#include <VizBridge/contracts/tarvex/TarvexVisuNode.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuData.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuMesh.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPointSet.h>
#include <VizBridge/contracts/tarvex/TarvexVisuWire.h>

#include <array>

using Node = TarvexAuthoredVisuNode;

TarvexVisuNode::TarvexVisuNodeType TarvexVisuNode::GetType() const {
    Node const* const node = m_context.Read(m_record, "TarvexVisuNode::GetType");
    return node == nullptr ? VisuUnknown : node->type;
}

bool TarvexVisuNode::IsLeaf() const {
    Node const* const node = m_context.Read(m_record, "TarvexVisuNode::IsLeaf");
    return node != nullptr && node->leaf;
}

TarvexVisuAttributes TarvexVisuNode::GetAttributes() const {
    Node const* const node = m_context.Read(m_record, "TarvexVisuNode::GetAttributes");
    if (node == nullptr) {
        return TarvexVisuAttributes();
    }
    return TarvexVisuAttributes(m_context, {m_record, &node->attributes});
}

TarvexVisuMesh TarvexVisuNode::GetMesh() const {
    Node const* const node = m_context.Read(m_record, "TarvexVisuNode::GetMesh");
    if (node == nullptr) {
        return TarvexVisuMesh();
    }
    return TarvexVisuMesh(m_context, {m_record, &node->mesh});
}

TarvexVisuWire TarvexVisuNode::GetWire() const {
    Node const* const node = m_context.Read(m_record, "TarvexVisuNode::GetWire");
    if (node == nullptr) {
        return TarvexVisuWire();
    }
    return TarvexVisuWire(m_context, {m_record, &node->wire});
}

TarvexVisuPointSet TarvexVisuNode::GetPointSet() const {
    Node const* const node = m_context.Read(m_record, "TarvexVisuNode::GetPointSet");
    if (node == nullptr) {
        return TarvexVisuPointSet();
    }
    return TarvexVisuPointSet(m_context, {m_record, &node->pointSet});
}

TarvexVisuPMI TarvexVisuNode::GetPMI() const {
    Node const* const node = m_context.Read(m_record, "TarvexVisuNode::GetPMI");
    if (node == nullptr) {
        return TarvexVisuPMI();
    }
    return TarvexVisuPMI(m_context, {m_record, &node->pmi});
}

char const* TarvexVisuNode::NodeTypeAsString(TarvexVisuNodeType type) {
    static std::array<char const*, 58> const names = {
        "VisuUnknown",
        "VisuRoot",
        "VisuGroup",
        "VisuInstance",
        "VisuBody",
        "VisuMesh",
        "VisuFace",
        "VisuWire",
        "VisuEdge",
        "VisuPointSet",
        "VisuPMI",
        "VisuPMIGroup",
        "VisuNoteGroup",
        "VisuNote",
        "VisuFlagNote",
        "VisuTextNote",
        "VisuDatumGroup",
        "VisuDatumFeature",
        "VisuDatumTarget",
        "VisuDatumReferenceFrame",
        "VisuDimensionGroup",
        "VisuDimensionDistance",
        "VisuDimensionLength",
        "VisuDimensionAngle",
        "VisuDimensionRadius",
        "VisuDimensionDiameter",
        "VisuDimensionChamfer",
        "VisuDimensionSlope",
        "VisuDimensionCoordinate",
        "VisuDimensionCurvilinear",
        "VisuDimensionOffset",
        "VisuDimensionBalloon",
        "VisuDimensionOther",
        "VisuGeomTolGroup",
        "VisuGeomTolStraightness",
        "VisuGeomTolFlatness",
        "VisuGeomTolCircularity",
        "VisuGeomTolCylindricity",
        "VisuGeomTolLineProfile",
        "VisuGeomTolSurfaceProfile",
        "VisuGeomTolAngularity",
        "VisuGeomTolPerpendicularity",
        "VisuGeomTolParallelism",
        "VisuGeomTolPosition",
        "VisuGeomTolConcentricity",
        "VisuGeomTolCoaxiality",
        "VisuGeomTolSymmetry",
        "VisuGeomTolCircularRunout",
        "VisuGeomTolTotalRunout",
        "VisuGeomTolAxisStraightness",
        "VisuGeomTolLineProfileDatum",
        "VisuGeomTolSurfaceProfileDatum",
        "VisuGeomTolCompositePosition",
        "VisuGeomTolCompositeProfile",
        "VisuGeomTolDatumSystem",
        "VisuGeomTolOther",
        "VisuRoughnessGroup",
        "VisuRoughness",
    };
    int const value = type;
    if (value < 0 || value >= static_cast<int>(names.size())) {
        return names[VisuUnknown];
    }
    return names[static_cast<std::size_t>(value)];
}
