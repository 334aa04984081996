#include <VizBridge/contracts/tarvex/TarvexVisuNode.h>

#include <gtest/gtest.h>

#include <set>
#include <string>

namespace {

using Node = TarvexVisuNode;

struct NameCase {
    int value;
    char const* name;
};

class TarvexNodeTypeNameTest : public ::testing::TestWithParam<NameCase> {};

TEST_P(TarvexNodeTypeNameTest, NamesTheValue) {
    EXPECT_STREQ(Node::NodeTypeAsString(static_cast<Node::TarvexVisuNodeType>(GetParam().value)),
                 GetParam().name);
}

INSTANTIATE_TEST_SUITE_P(
    Values, TarvexNodeTypeNameTest,
    ::testing::Values(NameCase{0, "VisuUnknown"}, NameCase{5, "VisuMesh"}, NameCase{7, "VisuWire"},
                      NameCase{9, "VisuPointSet"}, NameCase{10, "VisuPMI"},
                      NameCase{12, "VisuNoteGroup"}, NameCase{16, "VisuDatumGroup"},
                      NameCase{20, "VisuDimensionGroup"}, NameCase{33, "VisuGeomTolGroup"},
                      NameCase{56, "VisuRoughnessGroup"}, NameCase{57, "VisuRoughness"},
                      NameCase{-1, "VisuUnknown"}, NameCase{58, "VisuUnknown"},
                      NameCase{1000, "VisuUnknown"}),
    [](::testing::TestParamInfo<NameCase> const& info) {
        return "V" + std::to_string(info.param.value < 0 ? 9999 : info.param.value);
    });

TEST(TarvexNodeTypeTest, TheEnumeratorsHaveTheirFixedValues) {
    EXPECT_EQ(Node::VisuMesh, 5);
    EXPECT_EQ(Node::VisuWire, 7);
    EXPECT_EQ(Node::VisuPointSet, 9);
    EXPECT_EQ(Node::VisuPMI, 10);
    EXPECT_EQ(Node::VisuNoteGroup, 12);
    EXPECT_EQ(Node::VisuDatumGroup, 16);
    EXPECT_EQ(Node::VisuDimensionGroup, 20);
    EXPECT_EQ(Node::VisuGeomTolGroup, 33);
    EXPECT_EQ(Node::VisuRoughnessGroup, 56);
    EXPECT_EQ(Node::VisuRoughness, 57);
}

TEST(TarvexNodeTypeTest, EveryValueHasANameOfItsOwn) {
    std::set<std::string> names;
    for (int value = 0; value <= 57; ++value) {
        std::string const name =
            Node::NodeTypeAsString(static_cast<Node::TarvexVisuNodeType>(value));
        EXPECT_EQ(name.rfind("Visu", 0), 0u) << value;
        EXPECT_TRUE(names.insert(name).second) << name << " stands twice";
    }
}

TEST(TarvexNodeTypeTest, ADefaultNodeIsAnEmptyBranch) {
    Node const node;
    EXPECT_EQ(node.GetType(), Node::VisuUnknown);
    EXPECT_FALSE(node.IsLeaf());
    EXPECT_EQ(node.GetMesh().GetFaceIterator().GetCount(), 0);
    EXPECT_EQ(node.GetPMI().GetTextIterator().GetCount(), 0);
    bool hidden = true;
    EXPECT_FALSE(node.GetAttributes().GetHidden(hidden));
}

} // namespace
