#include "contracts/tarvex/TarvexPolicy.h"
#include "support/BuildStructure.h"
#include "support/DebugCapture.h"

#include <gtest/gtest.h>

namespace VizBridgeTarvex {
namespace {

TEST(ImportAndBuildPS, IsAlwaysTrueAndStartsFromZeroedTimers) {
    TarvexModel model;
    model.SetProductName(u"Prod");
    model.AddPart(1, u"P");
    model.AddRootInstance(1, u"P.1");
    auto const s = buildStructure(model);
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    TarvexPolicy policy;
    DebugCapture debug;

    VizBuilder builder(*s, input, &policy);
    builder.SetImportVisu(false);
    builder.SetImportPMI(false);
    for (int run = 0; run < 2; ++run) {
        EXPECT_TRUE(builder.ImportAndBuildPS());
        EXPECT_EQ(builder.GetTotalImportBrepTime(), 0.0);
        EXPECT_EQ(builder.GetTotalImportGeomTime(), 0.0);
        EXPECT_EQ(builder.GetTotalImportSemanticPMITime(), 0.0);
        EXPECT_EQ(builder.GetNumberOfProcessorsUsed(), 1);
    }
    VizBuilder const copy(builder);
    EXPECT_EQ(copy.GetNumberOfProcessorsUsed(), 1);
    EXPECT_TRUE(debug.texts().empty()) << "a clean import says nothing";
}

} // namespace
} // namespace VizBridgeTarvex
