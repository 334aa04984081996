#include "support/BuildStructure.h"
#include "support/DebugCapture.h"
#include "support/ProgressRecorder.h"
#include "support/ScriptedModeler.h"
#include "support/VizBuilderTestPeer.h"
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/model/VizPSEntry.h>

#include <gtest/gtest.h>

#include <thread>

namespace VizBridgeTarvex {
namespace {

using Answer = ScriptedModeler::Answer;

/// Product "Prod": P.1 of part 10, E.1 of the empty sub-assembly 20, A.1 of sub-assembly 30
/// (Q.1 of part 40, P.2 of part 10), M.1 of part 50 whose file is missing.
TarvexModel makeProduct() {
    TarvexModel model;
    model.SetProductName(u"Prod");
    model.AddPart(10, u"PartP", u"p.prt");
    model.AddAssembly(20, u"Empty", u"e.asm");
    model.AddAssembly(30, u"Asm", u"a.asm");
    model.AddPart(40, u"PartQ", u"q.prt");
    model.AddPart(50, u"Missing", u"m.prt");
    model.AddRootInstance(10, u"P.1");
    model.AddRootInstance(20, u"E.1");
    model.AddRootInstance(30, u"A.1");
    model.AddInstance(30, 40, u"Q.1");
    model.AddInstance(30, 10, u"P.2");
    model.AddRootInstance(50, u"M.1");
    model.AddMissingFile(u"/lost/m.prt");
    return model;
}

/// A structure built from a model, and a builder on it.
struct Import {
    explicit Import(TarvexModel& m)
        : model(m), structure(buildStructure(m)), input(m.GetInputProductStructure()),
          builder(*structure, input, nullptr) {}
    TarvexModel& model;
    std::unique_ptr<VizProductStructure> structure;
    TarvexInputProductStructure input;
    VizBuilder builder;
};

WString const kNull; // marks no text in the tables below
ProgressCall call(int current, int total, WString const& text) {
    return {current, total, &text == &kNull ? std::nullopt : std::optional<WString>(text)};
}

TEST(InstanceDataPhase, SingleProcessProgressWithoutModelerServices) {
    TarvexScopedProcessors const processors(1, 2);
    TarvexModel model = makeProduct();
    Import run(model);
    ProgressRecorder progress;
    DebugCapture debug;
    run.builder.SetProgressCallback(&ProgressRecorder::callback);

    EXPECT_TRUE(run.builder.ImportAndBuildPS());

    std::vector<ProgressCall> const expected = {
        call(0, 5, kNull),
        call(1, 5, u"Importing  BREP from PartP"),
        call(2, 5, u"Empty or invalid reference Empty"),
        call(2, 5, u"Importing  BREP from PartQ"),
        call(3, 5, u"Importing  BREP from PartP"), // not loaded: tried again
        call(5, 5, kNull),
    };
    EXPECT_EQ(ProgressRecorder::calls(), expected);
    EXPECT_EQ(
        run.structure->GetErrorMessages(),
        (std::vector<WString>{u"Could not import Part 'PartP'.", u"Could not import Part 'PartQ'.",
                              u"Missing File /lost/m.prt"}));
    EXPECT_EQ(debug.texts(),
              (std::vector<WString>{
                  u"VizBuilder: no modeler services are set, so no BREP part can be imported",
                  u"Error on RefID 10: ", u"Error on RefID 40: ", u"Error on RefID 10: "}));
    EXPECT_EQ(run.builder.GetNumberOfProcessorsUsed(), 1);
}

TEST(InstanceDataPhase, SingleProcessImportsEachPartOnceAndCountsOnlyImports) {
    for (bool importPMI : {false, true}) {
        TarvexScopedProcessors const processors(1, 2);
        TarvexModel model = makeProduct();
        Import run(model);
        ScriptedModeler modeler;
        ProgressRecorder progress;
        run.builder.SetModelerServices(&modeler);
        run.builder.SetImportPMI(importPMI);
        run.builder.SetProgressCallback(&ProgressRecorder::callback);

        run.builder.ImportAndBuildPS();

        // With PMI on, a part without semantic PMI gets no visualisation import either.
        std::vector<ProgressCall> const expected = {
            call(0, 5, kNull),
            call(1, 5, u"Importing Scripted BREP from PartP"),
            call(2, 5, u"Empty or invalid reference Empty"),
            call(2, 5, u"Importing Scripted BREP from PartQ"),
            call(5, 5, kNull),
        };
        EXPECT_EQ(ProgressRecorder::calls(), expected);
        EXPECT_EQ(modeler.importedIds(), (std::vector<int>{10, 40}));
        EXPECT_TRUE(run.structure->IsBREPLoaded(10));
        EXPECT_TRUE(run.structure->IsBREPLoaded(40));
        EXPECT_FALSE(run.structure->IsBREPLoaded(50)) << "missing";
        EXPECT_EQ(run.structure->GetVizPartContainer(10)->GetTypeName(),
                  "TestModeler BREP Container");

        run.builder.ImportAndBuildPS();
        EXPECT_EQ(modeler.importedIds().size(), 2u) << "loaded parts are not imported again";
    }
}

TEST(InstanceDataPhase, NoProgressTextsAreMadeWithoutACallback) {
    TarvexScopedProcessors const processors(1, 2);
    TarvexModel model = makeProduct();
    Import run(model);
    struct NamelessModeler : ScriptedModeler {
        int names = 0;
        WString GetName() override {
            ++names;
            return u"x";
        }
    } modeler;
    run.builder.SetModelerServices(&modeler);
    run.builder.ImportAndBuildPS();
    EXPECT_EQ(modeler.names, 0);
    EXPECT_EQ(modeler.importedIds().size(), 2u);
}

struct FailureCase {
    char const* name;
    Answer answer;
    WString stored;
    WString debug;
};

class PartImportFailure : public testing::TestWithParam<FailureCase> {};

TEST_P(PartImportFailure, StoresItsTextAndTheWalkGoesOn) {
    FailureCase const& c = GetParam();
    TarvexScopedProcessors const processors(1, 2);
    TarvexModel model = makeProduct();
    Import run(model);
    ScriptedModeler modeler;
    modeler.script(10, c.answer);
    run.builder.SetModelerServices(&modeler);
    DebugCapture debug;

    run.builder.ImportAndBuildPS();

    EXPECT_EQ(modeler.importedIds(), (std::vector<int>{10, 40, 10})) << "tried at each occurrence";
    EXPECT_FALSE(run.structure->IsBREPLoaded(10));
    EXPECT_TRUE(run.structure->IsBREPLoaded(40));
    EXPECT_EQ(run.structure->GetErrorMessages(),
              (std::vector<WString>{c.stored, u"Missing File /lost/m.prt"}))
        << "one text for two attempts";
    EXPECT_EQ(debug.texts(), (std::vector<WString>{c.debug, c.debug}));
    EXPECT_GE(run.builder.GetTotalImportBrepTime(), 0.0);
}

INSTANTIATE_TEST_SUITE_P(
    Cases, PartImportFailure,
    testing::Values(FailureCase{"falseWithoutError", Answer::FalseNoError,
                                u"Could not import Part 'PartP'.", u"Error on RefID 10: "},
                    FailureCase{"falseWithError", Answer::FalseWithError,
                                u"Could not import Part 'PartP'. Failed with error : bad face",
                                u"Error on RefID 10: bad face"},
                    FailureCase{"trueWithoutContainer", Answer::TrueWithoutContainer,
                                u"Could not import Part 'PartP'. Failed with error : nothing made",
                                u"Error on RefID 10: nothing made"},
                    FailureCase{"stdException", Answer::ThrowStd,
                                u"Error on Part Import (RefID 10) : modeler broke",
                                u"Error on RefID 10: modeler broke"},
                    FailureCase{
                        "otherException", Answer::ThrowOther,
                        u"Part Import (RefID 10) Error : Unknown Exception",
                        u"Error on RefID 10: Unknown exception while importing product structure"}),
    [](testing::TestParamInfo<FailureCase> const& info) { return info.param.name; });

TEST(InstanceDataPhase, AFailureAfterTheContainerWasStoredKeepsIt) {
    TarvexScopedProcessors const processors(1, 2);
    TarvexModel model = makeProduct();
    TarvexFault fault;
    fault.operation = "TarvexPartImportResult::GetPMIData";
    fault.what = "no PMI";
    model.Faults().Add(fault);
    Import run(model);
    ScriptedModeler modeler;
    run.builder.SetModelerServices(&modeler);

    run.builder.ImportAndBuildPS();

    EXPECT_TRUE(run.structure->IsBREPLoaded(10));
    EXPECT_EQ(run.structure->GetErrorMessages(),
              (std::vector<WString>{u"Error on Part Import (RefID 10) : no PMI",
                                    u"Error on Part Import (RefID 40) : no PMI",
                                    u"Missing File /lost/m.prt"}));
}

struct PathCase {
    char const* name;
    bool oneReference;
    bool importVisu;
    int toUse;
    int physical;
    int used;
    bool spooler;
};

class PathChoice : public testing::TestWithParam<PathCase> {};

TEST_P(PathChoice, FollowsReferencesVisuAndProcessorCounts) {
    PathCase const& c = GetParam();
    TarvexScopedProcessors const processors(c.toUse, c.physical);
    TarvexModel model;
    model.AddPart(1, u"One");
    model.AddRootInstance(1, u"One.1");
    if (!c.oneReference) {
        model.AddPart(2, u"Two");
        model.AddRootInstance(2, u"Two.1");
    }
    Import run(model);
    TarvexFault fault; // makes the spooler's creation visible
    fault.operation = "TarvexMultiProcessSpooler::TarvexMultiProcessSpooler";
    fault.what = "spooler made";
    model.Faults().Add(fault);
    run.builder.SetImportVisu(c.importVisu);

    if (c.spooler) {
        EXPECT_THROW(run.builder.ImportAndBuildPS(), std::runtime_error);
    } else {
        EXPECT_TRUE(run.builder.ImportAndBuildPS());
    }
    EXPECT_EQ(run.builder.GetNumberOfProcessorsUsed(), c.used);
}

INSTANTIATE_TEST_SUITE_P(
    Cases, PathChoice,
    testing::Values(PathCase{"oneReference", true, false, 0, 8, 1, false},
                    PathCase{"visualisationData", false, true, 0, 8, 1, false},
                    PathCase{"oneProcessorToUse", false, false, 1, 8, 1, false},
                    PathCase{"onePhysicalProcessor", false, false, 0, 1, 1, false},
                    PathCase{"allProcessors", false, false, 0, 8, 8, true},
                    PathCase{"someProcessors", false, false, 3, 8, 3, true},
                    PathCase{"moreThanThereAre", false, false, 4, 2, 4, true}),
    [](testing::TestParamInfo<PathCase> const& info) { return info.param.name; });

TEST(InstanceDataPhase, MultiProcessImportsEachDeliveredPartOnceOnTheCallersThread) {
    TarvexScopedProcessors const processors(0, 2);
    TarvexModel model = makeProduct();
    model.SetSpoolerDeliveryOrder({40, 50, 10});
    Import run(model);
    model.SetUniqueReferencesCount(7); // the phase reads the input's count, not the tree's
    ScriptedModeler modeler;
    ProgressRecorder progress;
    run.builder.SetModelerServices(&modeler);
    run.builder.SetProgressCallback(&ProgressRecorder::callback);

    run.builder.ImportAndBuildPS();

    std::vector<ProgressCall> const expected = {
        call(0, 7, kNull),
        call(1, 7, u"Importing Scripted BREP from PartQ"),
        call(2, 7, u"Importing Scripted BREP from PartP"),
    };
    EXPECT_EQ(ProgressRecorder::calls(), expected) << "no closing call, no empty-assembly text";
    EXPECT_EQ(modeler.importedIds(), (std::vector<int>{40, 10}));
    for (ScriptedModeler::Call const& c : modeler.calls())
        EXPECT_EQ(c.thread, std::this_thread::get_id());
    EXPECT_EQ(run.builder.GetNumberOfProcessorsUsed(), 2);
    EXPECT_GT(run.builder.GetTotalImportBrepTime(), 0.0) << "the polling passes count";

    run.builder.ImportAndBuildPS();
    EXPECT_EQ(modeler.importedIds(), (std::vector<int>{40, 10, 40, 10}))
        << "the spooler's deliveries are not tested for being loaded";
}

TEST(InstanceDataPhase, SingleProcessTotalsComeFromTheStructure) {
    TarvexScopedProcessors const processors(1, 2);
    TarvexModel model = makeProduct();
    Import run(model);
    model.SetUniqueReferencesCount(7);
    ScriptedModeler modeler;
    ProgressRecorder progress;
    run.builder.SetModelerServices(&modeler);
    run.builder.SetProgressCallback(&ProgressRecorder::callback);
    run.builder.ImportAndBuildPS();
    ASSERT_EQ(ProgressRecorder::calls().size(), 5u);
    EXPECT_EQ(ProgressRecorder::calls().front(), call(0, 7, kNull));
    EXPECT_EQ(ProgressRecorder::calls()[1].total, 5);
    EXPECT_EQ(ProgressRecorder::calls().back(), call(7, 7, kNull));
}

TEST(InstanceDataPhase, MultiProcessUsesTheReferencesOwnIdAndSkipsFailedConversions) {
    TarvexScopedProcessors const processors(2, 2);
    TarvexModel model = makeProduct();
    model.SetSpoolerIdAlias(40, 99);
    model.FindReference(10)->geometry.conversionFails = true;
    Import run(model);
    ScriptedModeler modeler;
    run.builder.SetModelerServices(&modeler);
    DebugCapture debug;

    run.builder.ImportAndBuildPS();

    EXPECT_EQ(debug.texts(), std::vector<WString>{u"MISMATCHING REFERENCE IDS\n"});
    EXPECT_EQ(modeler.importedIds(), std::vector<int>{40});
    EXPECT_TRUE(run.structure->IsBREPLoaded(40));
    EXPECT_FALSE(run.structure->IsBREPLoaded(99));
    EXPECT_FALSE(run.structure->IsBREPLoaded(10));
    EXPECT_EQ(run.structure->GetErrorMessages(), std::vector<WString>{u"Missing File /lost/m.prt"});
}

TEST(InstanceDataPhase, ASpoolerFailureReachesTheCaller) {
    TarvexScopedProcessors const processors(2, 2);
    TarvexModel model = makeProduct();
    Import run(model);
    TarvexFault fault;
    fault.operation = "TarvexMultiProcessSpooler::HasDataAvailableFor";
    fault.skip = 1;
    fault.kind = TarvexFaultKind::NonStdException;
    model.Faults().Add(fault);
    EXPECT_THROW(run.builder.ImportAndBuildPS(), TarvexForeignError);
}

TEST(InstanceDataPhase, AReferenceThatContainsItselfIsRefusedOnce) {
    TarvexScopedProcessors const processors(1, 2);
    TarvexModel model;
    model.AddAssembly(20, u"Loop");
    model.AddPart(30, u"Leaf");
    model.AddRootInstance(20, u"L.1");
    model.AddInstance(20, 20, u"Self");
    model.AddInstance(20, 30, u"X.1");
    Import run(model);
    ScriptedModeler modeler;
    run.builder.SetModelerServices(&modeler);

    run.builder.ImportAndBuildPS();

    EXPECT_EQ(run.structure->ToString(), u"Product: \n"
                                         u"   Product: instance: L.1 of reference: Loop\n"
                                         u"      Part: instance: X.1 of reference: Leaf\n");
    EXPECT_EQ(run.structure->GetErrorMessages(),
              std::vector<WString>{
                  u"Error on Product Structure Instance (RefID 20) : Reference contains itself"});
    EXPECT_EQ(modeler.importedIds(), std::vector<int>{30});
}

TEST(InstanceDataPhase, EntitiesLeadDownToTheirPartContainer) {
    TarvexScopedProcessors const processors(1, 2);
    TarvexModel model;
    model.AddAssembly(20, u"A");
    model.AddAssembly(40, u"B");
    model.AddPart(50, u"Y");
    model.AddRootInstance(20, u"A.1");
    unsigned int const b = model.AddInstance(20, 40, u"B.1").instanceId;
    unsigned int const y = model.AddInstance(40, 50, u"Y.1").instanceId;
    Import run(model);
    ScriptedModeler modeler;
    run.builder.SetModelerServices(&modeler);
    run.builder.ImportAndBuildPS();
    TarvexInputPSReference const top = run.input.GetRootInstance(0).GetReference();

    WString path;
    EXPECT_EQ(
        VizBuilderTestPeer::partContainerOf(run.builder, top, model.MakeEntity({b, y}, 7), path),
        run.structure->GetVizPartContainer(50));
    EXPECT_EQ(path, u"B.1/Y.1");

    path = u"kept";
    EXPECT_EQ(VizBuilderTestPeer::partContainerOf(run.builder, top, model.MakeEntity({}, 7), path),
              nullptr);
    EXPECT_EQ(path, u"kept");

    TarvexInputPSReference const part = run.input.GetReferenceFromId(50);
    EXPECT_EQ(VizBuilderTestPeer::partContainerOf(run.builder, part, model.MakeEntity({}, 7), path),
              run.structure->GetVizPartContainer(50));
    EXPECT_EQ(path, u"kept");
}

} // namespace
} // namespace VizBridgeTarvex
