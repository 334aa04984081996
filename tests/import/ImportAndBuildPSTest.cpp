#include "support/BuildStructure.h"
#include "support/DebugCapture.h"
#include "support/ScriptedModeler.h"
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPolicy.h>

#include <gtest/gtest.h>

#include <chrono>
#include <thread>

namespace VizBridgeTarvex {
namespace {

TarvexModel twoParts() {
    TarvexModel model;
    model.SetProductName(u"Prod");
    model.AddPart(1, u"P");
    model.AddPart(2, u"Q");
    model.AddRootInstance(1, u"P.1");
    model.AddRootInstance(2, u"Q.1");
    return model;
}

TEST(ImportAndBuildPS, IsTrueEvenWhenEveryReferenceFails) {
    for (int toUse : {1, 2}) {
        TarvexScopedProcessors const processors(toUse, 2);
        TarvexModel model = twoParts();
        auto const s = buildStructure(model);
        TarvexInputProductStructure const input = model.GetInputProductStructure();
        TarvexPolicy policy;
        DebugCapture debug;
        VizBuilder builder(*s, input, &policy);

        EXPECT_TRUE(builder.ImportAndBuildPS());
        std::vector<WString> errors = s->GetErrorMessages();
        EXPECT_EQ(errors, (std::vector<WString>{u"Could not import Part 'P'.",
                                                u"Could not import Part 'Q'."}));
        EXPECT_EQ(debug.texts().size(), 3u); // the missing modeler, then a line per part
    }
}

TEST(ImportAndBuildPS, ASecondRunStartsFromZeroedTimers) {
    TarvexScopedProcessors const processors(1, 2);
    TarvexModel model = twoParts();
    auto const s = buildStructure(model);
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    struct SlowModeler : ScriptedModeler {
        bool ImportPart(int const& id, TarvexPartDocument& document, TarvexPartImportResult& result,
                        VizPartContainer*& container, TarvexPolicy* policy,
                        WString& error) override {
            std::this_thread::sleep_for(std::chrono::milliseconds(5));
            return ScriptedModeler::ImportPart(id, document, result, container, policy, error);
        }
    } modeler;
    VizBuilder builder(*s, input, nullptr);
    builder.SetModelerServices(&modeler);

    builder.ImportAndBuildPS();
    EXPECT_GE(builder.GetTotalImportBrepTime(), 0.009) << "two imports of at least 5 ms";
    builder.ImportAndBuildPS(); // everything is loaded: nothing to import, nothing to time
    EXPECT_EQ(builder.GetTotalImportBrepTime(), 0.0);
    EXPECT_EQ(builder.GetTotalImportGeomTime(), 0.0);
    EXPECT_EQ(builder.GetTotalImportSemanticPMITime(), 0.0);
    EXPECT_EQ(modeler.importedIds(), (std::vector<int>{1, 2}));
}

} // namespace
} // namespace VizBridgeTarvex
