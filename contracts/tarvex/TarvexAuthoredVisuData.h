#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuPMI.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexLengthUnitType.h>
#include <VizBridge/contracts/tarvex/TarvexVisuNode.h>

#include <vector>

/// A node of the flat node list. What a leaf shows is read by its kind: a mesh node's
/// GetMesh gives `mesh`, and so on; the others stay empty unless a test fills them.
struct TarvexAuthoredVisuNode {
    TarvexVisuNode::TarvexVisuNodeType type = TarvexVisuNode::VisuUnknown;
    bool leaf = true;
    TarvexAuthoredVisuAttributes attributes;
    TarvexAuthoredVisuMesh mesh;
    TarvexAuthoredVisuWire wire;
    TarvexAuthoredVisuPointSet pointSet;
    TarvexAuthoredVisuPMI pmi;
};

/// The visualisation data of a document: a flat list of nodes in walk order (a group's
/// nodes follow it; nothing records depth), and its views and captures.
struct TarvexAuthoredVisuData {
    TarvexLengthUnitType unit = TarvexLengthUnit_Unknown;
    std::vector<TarvexAuthoredVisuNode> nodes;
    std::vector<TarvexAuthoredVisuView> views;
    std::vector<TarvexAuthoredVisuCapture> captures;
};
