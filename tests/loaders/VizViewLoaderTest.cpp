#include "LoaderTestSupport.h"

#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexVisuView.h>
#include <VizBridge/loaders/VizViewLoader.h>

#include <gtest/gtest.h>

#include <memory>
#include <vector>

namespace {

using namespace LoaderTest;
using KolbaVizCore::VizView;
using VizBridgeTarvex::VizViewLoader;

TEST(VizViewLoaderTest, FillsStatesNamesPlaneAndAnnotationMembersInOrder) {
    TarvexAuthoredVisuView record;
    record.hidden = true;
    record.displayName = u"Front";
    record.id = u"v-7";
    record.mechanicalId = u"m-7";
    record.axis = TarvexVisuTriples{{{1, 2, 3}, {4, 5, 6}, {7, 8, 9}}};
    record.annotationIds = {u"a2", u"a1", u"a2"};
    TarvexVisuView const source = Make<TarvexVisuView>(record);
    VizViewLoader loader(source, nullptr, false);
    std::unique_ptr<VizView> const view = LoadAs<VizView>(loader);
    ASSERT_TRUE(view);
    EXPECT_TRUE(view->GetHidden());
    EXPECT_EQ(view->GetName(), u"Front");
    EXPECT_EQ(view->GetVisualID(), u"v-7");
    EXPECT_EQ(view->GetMechanicalID(), u"m-7");
    float origin[3], first[3], second[3];
    ASSERT_TRUE(view->GetPlane(origin, first, second));
    EXPECT_EQ(std::vector<float>(origin, origin + 3), (std::vector<float>{1, 2, 3}));
    EXPECT_EQ(std::vector<float>(first, first + 3), (std::vector<float>{4, 5, 6}));
    EXPECT_EQ(std::vector<float>(second, second + 3), (std::vector<float>{7, 8, 9}));
    EXPECT_EQ(view->GetMembers(), (std::vector<VizPort::WString>{u"a2", u"a1", u"a2"}));
}

} // namespace
