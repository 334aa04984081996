#include <VizBridge/loaders/PMITypeMapping.h>

#include <gtest/gtest.h>

#include <tuple>
#include <vector>

namespace {

using namespace VizBridgeTarvex;
using NodeType = TarvexVisuNode::TarvexVisuNodeType;
using namespace KolbaVizCore;

NodeType Node(int value) {
    return static_cast<NodeType>(value);
}
VizPMIType::ID Pmi(int value) {
    return static_cast<VizPMIType::ID>(value);
}

// node type, PMI type, node type of its group
std::vector<std::tuple<int, int, int>> const kNodeRows = {
    {-1, 0, 0},   {0, 0, 0},    {5, 0, 0},    {9, 0, 0},    {10, 1, 0},   {11, 0, 0},
    {12, 2, 12},  {15, 5, 12},  {16, 6, 16},  {19, 9, 16},  {20, 10, 20}, {32, 22, 20},
    {33, 23, 33}, {55, 45, 33}, {56, 46, 56}, {57, 47, 56}, {58, 0, 0},   {1000, 0, 0}};

// PMI type, node type, entity type
std::vector<std::tuple<int, int, EntityType>> const kPMIRows = {
    {-1, 0, UnknownPMI}, {0, 0, UnknownPMI}, {1, 10, PMI},      {2, 12, Note},
    {5, 15, Note},       {6, 16, Datum},     {9, 19, Datum},    {10, 20, Dimension},
    {22, 32, Dimension}, {23, 33, GeomTol},  {45, 55, GeomTol}, {46, 56, Roughness},
    {47, 57, Roughness}, {48, 0, UnknownPMI}};

TEST(PMITypeMappingTest, NodeTypesGiveTheirPMITypeAndGroup) {
    for (auto const& [node, pmi, group] : kNodeRows) {
        SCOPED_TRACE(node);
        EXPECT_EQ(GetVizPMITypeFromVisuNodeType(Node(node)), pmi);
        EXPECT_EQ(GetVisuPMIGroupTypeFromVisuNodeType(Node(node)), group);
    }
}

TEST(PMITypeMappingTest, PMITypesGiveTheirNodeTypeAndEntityType) {
    for (auto const& [pmi, node, entity] : kPMIRows) {
        SCOPED_TRACE(pmi);
        EXPECT_EQ(GetVisuNodeTypeFromVizPMIType(Pmi(pmi)), node);
        EXPECT_EQ(GetEntityTypeFromVizPMIType(Pmi(pmi)), entity);
    }
}

// A round trip keeps exactly the PMI node types, and a member of a group is tagged like it.
TEST(PMITypeMappingTest, RoundTripsAndGroupsAgreeOverAllNodeTypes) {
    for (int value = -3; value <= 70; ++value) {
        SCOPED_TRACE(value);
        VizPMIType::ID const pmiType = GetVizPMITypeFromVisuNodeType(Node(value));
        bool const isPMI = value == 10 || (value >= 12 && value <= 57);
        EXPECT_EQ(GetVisuNodeTypeFromVizPMIType(pmiType), isPMI ? value : 0);
        NodeType const group = GetVisuPMIGroupTypeFromVisuNodeType(Node(value));
        if (group == 0)
            continue;
        EXPECT_EQ(GetVisuPMIGroupTypeFromVisuNodeType(group), group);
        EXPECT_EQ(GetEntityTypeFromVizPMIType(GetVizPMITypeFromVisuNodeType(group)),
                  GetEntityTypeFromVizPMIType(pmiType));
    }
}

} // namespace
