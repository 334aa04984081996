#include <VizBridge/loaders/PMITypeMapping.h>

namespace VizBridgeTarvex {

namespace {

using KolbaVizCore::EntityType;
using KolbaVizCore::VizPMIType;
using NodeType = TarvexVisuNode::TarvexVisuNodeType;

// Node types of PMI in groups and PMI types of the same kind differ by this much.
constexpr int kGroupedOffset =
    static_cast<int>(TarvexVisuNode::VisuNoteGroup) - static_cast<int>(VizPMIType::FirstNote);

/// One group of PMI: its node types, led by its own, and the entity type of its members.
struct PMIGroup {
    NodeType first;
    NodeType last;
    EntityType entityType;
};

constexpr PMIGroup kGroups[] = {
    {TarvexVisuNode::VisuNoteGroup, TarvexVisuNode::VisuTextNote, KolbaVizCore::Note},
    {TarvexVisuNode::VisuDatumGroup, TarvexVisuNode::VisuDatumReferenceFrame, KolbaVizCore::Datum},
    {TarvexVisuNode::VisuDimensionGroup, TarvexVisuNode::VisuDimensionOther,
     KolbaVizCore::Dimension},
    {TarvexVisuNode::VisuGeomTolGroup, TarvexVisuNode::VisuGeomTolOther, KolbaVizCore::GeomTol},
    {TarvexVisuNode::VisuRoughnessGroup, TarvexVisuNode::VisuRoughness, KolbaVizCore::Roughness},
};

PMIGroup const* findGroup(int const nodeType) {
    for (PMIGroup const& group : kGroups)
        if (nodeType >= group.first && nodeType <= group.last)
            return &group;
    return nullptr;
}

} // namespace

VizPMIType::ID GetVizPMITypeFromVisuNodeType(NodeType const& nodeType) {
    if (nodeType == TarvexVisuNode::VisuPMI)
        return VizPMIType::GenericPMI;
    if (findGroup(nodeType) != nullptr)
        return static_cast<VizPMIType::ID>(nodeType - kGroupedOffset);
    return VizPMIType::UndefinedPMI;
}

NodeType GetVisuNodeTypeFromVizPMIType(VizPMIType::ID const& pmiType) {
    if (pmiType == VizPMIType::GenericPMI)
        return TarvexVisuNode::VisuPMI;
    if (pmiType >= VizPMIType::FirstNote && pmiType <= VizPMIType::LastRoughness)
        return static_cast<NodeType>(pmiType + kGroupedOffset);
    return TarvexVisuNode::VisuUnknown;
}

NodeType GetVisuPMIGroupTypeFromVisuNodeType(NodeType nodeType) {
    PMIGroup const* const group = findGroup(nodeType);
    return group != nullptr ? group->first : TarvexVisuNode::VisuUnknown;
}

EntityType GetEntityTypeFromVizPMIType(VizPMIType::ID const& pmiType) {
    if (pmiType == VizPMIType::GenericPMI)
        return KolbaVizCore::PMI;
    PMIGroup const* const group = findGroup(GetVisuNodeTypeFromVizPMIType(pmiType));
    return group != nullptr ? group->entityType : KolbaVizCore::UnknownPMI;
}

} // namespace VizBridgeTarvex
