#include <VizBridge/referencemodeler/ReferenceModelerServices.h>
#include <VizBridge/referencemodeler/ReferencePartContainer.h>

#include "support/BuildStructure.h"
#include "support/DebugCapture.h"
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <thread>
#include <vector>

namespace VizReferenceModeler {
namespace {

using VizBridgeTarvex::VizBuilder;
using VizBridgeTarvex::VizProductStructure;

/// An assembly (1) at the root holding the parts 2 and 3 twice each and the part 4 once.
TarvexModel MakeModel() {
    TarvexModel model;
    model.SetProductName(u"Frame");
    model.AddAssembly(1, u"Frame");
    for (unsigned int part = 2; part <= 4; ++part) {
        model.AddPart(part, part == 4 ? u"Nut" : u"Part")
            .geometry.faces.push_back({10 * part, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 2}});
    }
    model.AddRootInstance(1, u"Frame.1");
    for (unsigned int part : {2u, 3u, 2u, 3u, 4u})
        model.AddInstance(1, part, u"Instance");
    return model;
}

/// The builder takes the modeler's containers, quotes its failures and calls it on the
/// importing thread only, whether the parts are converted here or by the spooler.
TEST(ReferenceModelerThroughTheBuilder, ImportsEveryPartOnTheCallersThread) {
    struct Mode {
        char const* name;
        int processors;
    };
    for (Mode const mode : {Mode{"single process", 1}, Mode{"spooler", 2}}) {
        SCOPED_TRACE(mode.name);
        TarvexScopedProcessors const processors(mode.processors, 4);
        TarvexModel const model = MakeModel();
        std::unique_ptr<VizProductStructure> const structure =
            VizBridgeTarvex::buildStructure(model);
        TarvexInputProductStructure const input = model.GetInputProductStructure();
        ReferenceModelerServices services;
        services.PlanFailure(4, {ReferenceModelerServices::FailureKind::ReturnFalse, "disk full"});
        DebugCapture const debug;

        VizBuilder builder(*structure, input, nullptr);
        builder.SetModelerServices(&services);
        builder.ImportAndBuildPS();
        EXPECT_EQ(builder.GetNumberOfProcessorsUsed(), mode.processors);

        for (int part : {2, 3}) {
            auto const* const container =
                dynamic_cast<ReferencePartContainer const*>(structure->GetVizPartContainer(part));
            ASSERT_NE(container, nullptr) << part;
            EXPECT_EQ(container->GetRefID(), part);
            EXPECT_TRUE(container->HasFace(10u * static_cast<unsigned int>(part)));
        }
        EXPECT_FALSE(structure->IsBREPLoaded(4));
        std::vector<WString> const errors = structure->GetErrorMessages();
        EXPECT_NE(std::find(errors.begin(), errors.end(),
                            u"Could not import Part 'Nut'. Failed with error : disk full"),
                  errors.end());

        std::vector<ReferenceModelerServices::ImportCall> const calls = services.GetImportCalls();
        std::vector<int> imported;
        for (ReferenceModelerServices::ImportCall const& call : calls) {
            EXPECT_EQ(call.thread, std::this_thread::get_id()) << call.referenceId;
            imported.push_back(call.referenceId);
        }
        std::sort(imported.begin(), imported.end());
        EXPECT_EQ(imported, (std::vector<int>{2, 3, 4}))
            << "a part that is loaded is not imported again";
    }
}

} // namespace
} // namespace VizReferenceModeler
