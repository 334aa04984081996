#pragma once

#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/contracts/kolba/VizPMIType.h>
#include <VizBridge/contracts/tarvex/TarvexVisuNode.h>

// Translations between the import library's node types, the scene's PMI type numbers and the
// entity types that tag PMI nodes. Node types 12 to 57 run in step with the PMI types 2 to 47;
// node type 10, a PMI of no group, is PMI type 1. Everything else is PMI type 0.

namespace VizBridgeTarvex {

/// The PMI type of a node type; 0 for every node type that is not a PMI.
KolbaVizCore::VizPMIType::ID
GetVizPMITypeFromVisuNodeType(TarvexVisuNode::TarvexVisuNodeType const& nodeType);

/// The node type of a PMI type; 0 for PMI type 0 and for every value beyond the known types.
TarvexVisuNode::TarvexVisuNodeType
GetVisuNodeTypeFromVizPMIType(KolbaVizCore::VizPMIType::ID const& pmiType);

/// The node type that leads the group of `nodeType` (a group's leader is its own group); 0
/// for a node type of no group, node type 10 included. Follow it with
/// GetVizPMITypeFromVisuNodeType for the group's PMI type.
TarvexVisuNode::TarvexVisuNodeType
GetVisuPMIGroupTypeFromVisuNodeType(TarvexVisuNode::TarvexVisuNodeType nodeType);

/// The entity type that tags a PMI of `pmiType`; UnknownPMI for PMI type 0 and for every
/// value beyond the known types. For the PMI loader and the PMI renderer.
KolbaVizCore::EntityType GetEntityTypeFromVizPMIType(KolbaVizCore::VizPMIType::ID const& pmiType);

} // namespace VizBridgeTarvex
