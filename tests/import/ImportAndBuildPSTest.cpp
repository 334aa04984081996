// The import: how its failures are recorded, from the instance tree to the parts, the instance
// data phase, which imports each part through the modeler, and the visualisation import of
// each part's tessellated data and PMI.
#include "support/BuildStructure.h"
#include "support/DebugCapture.h"
#include "support/ProgressRecorder.h"
#include "support/ScriptedModeler.h"
#include "support/VizBuilderTestPeer.h"
#include "support/VizProductStructureTestPeer.h"
#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexVisualizationImporter.h>
#include <VizBridge/import/BuilderErrors.h>
#include <VizBridge/model/VizPSEntry.h>

#include <gtest/gtest.h>

#include <optional>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace VizBridgeTarvex {
namespace {

using Answer = ScriptedModeler::Answer;
TarvexFaultKind const kStd = TarvexFaultKind::StdException;
TarvexFaultKind const kOther = TarvexFaultKind::NonStdException;

/// A fault that fires once, at the first call of `operation` on `subject`.
TarvexFault once(char const* operation, std::optional<unsigned int> subject,
                 TarvexFaultKind kind = kStd, char const* what = "boom") {
    return {operation, subject, kind, what, 0, 1};
}

struct FailureCase {
    char const* name;
    std::vector<TarvexFault> faults = {};
    Answer answer = Answer::Succeed; ///< the modeler's, for part 10
    bool visu = false;               ///< the visualisation road instead of the BREP one
    bool loop = false;               ///< B.1 also places A
    char const* off;                 ///< the report with the throw switch off
    char const* on = nullptr;        ///< with the switch on; null: the same
};

void names(std::vector<VizPSEntry*> const& entries, std::string& out) {
    for (VizPSEntry const* entry : entries) {
        out += ' ' + VizPort::Narrow(entry->GetInstanceName());
        names(entry->GetChildren(), out);
    }
}

/// Builds the shared product with the case's faults and imports it in the caller's process.
/// Reports what reached the caller, the tree's instances depth first and the references whose
/// containers were filed where they are not all of them, the stored texts and the debug texts.
std::string run(FailureCase const& c, bool allowThrow) {
    KolbaVizCore::ScopedAllowThrow const allow(allowThrow);
    TarvexScopedProcessors const processors(1, 2);
    SharedProduct product;
    for (TarvexFault const& fault : c.faults)
        product.model.Faults().Add(fault);
    if (c.loop)
        product.model.AddInstance(60, 30, u"A.2");
    ScriptedModeler modeler;
    modeler.script(10, c.answer);
    DebugCapture debug;
    std::unique_ptr<VizProductStructure> s;
    std::string out;
    try {
        buildStructure(product.model, s);
        TarvexInputProductStructure const input = product.model.GetInputProductStructure();
        VizBuilder builder(*s, input, nullptr);
        builder.SetModelerServices(&modeler);
        builder.SetImportVisu(c.visu);
        EXPECT_TRUE(builder.ImportAndBuildPS()) << "failures never show in the result";
    } catch (std::exception const& e) {
        out += std::string("thrown: ") + e.what() + '\n';
    } catch (TarvexForeignError const&) {
        out += "thrown: TarvexForeignError\n";
    }
    if (!s)
        return out + "no structure\n";
    std::string tree, loaded;
    names(s->GetChildren(), tree);
    for (int id : {10, 40, 50})
        if (s->IsBREPLoaded(id) || s->IsVizLoaded(id))
            loaded += ' ' + std::to_string(id);
    if (tree != " P.1 A.1 Q.1 B.1 P.2 M.1")
        out += "tree:" + tree + '\n';
    if (loaded != " 10 40 50")
        out += "loaded:" + loaded + '\n';
    return out + reportLines("stored: ", s->GetErrorMessages()) +
           reportLines("debug: ", debug.texts());
}

// With the switch on, a failure in the tree is stored at each level on its way up and then
// reaches the caller; a root's own failure reaches it unchanged and unrecorded. The imports
// never throw: there the switch changes nothing.
FailureCase const kCases[] = {
    {.name = "beforeTheIdIsReadTwiceUnderOneKey",
     .faults = {once("TarvexInputPSReference::IsPart", 40, kStd, "one"),
                once("TarvexInputPSReference::IsPart", 60, kStd, "two")},
     .off = "tree: P.1 A.1 M.1\n"
            "stored: Error on Product Structure Instance (RefID 0) : one"
            "Error on Product Structure Instance (RefID 0) : two\n"
            "debug: Error on RefID 0: one\ndebug: Error on RefID 0: two\n",
     .on = "thrown: one\ntree: P.1 A.1\nloaded:\n"
           "stored: Error on Product Structure Instance (RefID 0) : one\n"
           "debug: Error on RefID 0: one\n"},
    {.name = "twoLevelsDownNotAStdException",
     .faults = {once("TarvexInputPSReference::GetInstance", 60, kOther)},
     .off = "tree: P.1 A.1 Q.1 B.1 M.1\n"
            "stored: Product Structure Part Import (RefID 0) Error : Unknown Exception\n"
            "debug: Error on RefID 0: Unknown exception while importing Product Structure\n",
     .on = "thrown: Product Structure Part Import (RefID 0) Error : Unknown Exception\n"
           "tree: P.1 A.1 Q.1 B.1\nloaded:\n"
           "stored: Product Structure Part Import (RefID 0) Error : Unknown Exception\n"
           "stored: Error on Product Structure Instance (RefID 60) : "
           "Product Structure Part Import (RefID 0) Error : Unknown Exception\n"
           "debug: Error on RefID 0: Unknown exception while importing Product Structure\n"
           "debug: Error on RefID 60: "
           "Product Structure Part Import (RefID 0) Error : Unknown Exception\n"},
    {.name = "aRoot",
     .faults = {once("TarvexInputPSReference::GetInstancesCount", 30, kOther)},
     .off = "tree: P.1 M.1\n"
            "stored: Product Structure Part Import (RefID 30) Error : Unknown Exception\n"
            "debug: Error on RefID 30: Unknown exception while importing Product Structure\n",
     .on = "thrown: TarvexForeignError\ntree: P.1\nloaded:\n"},
    // B.1 places A, which holds B: the tree and the import refuse the loop once.
    {.name = "aReferenceThatContainsItself",
     .loop = true,
     .off = "stored: Error on Product Structure Instance (RefID 30) : Reference contains itself\n"
            "debug: Error on RefID 30: Reference contains itself\n",
     .on = "thrown: Reference contains itself\ntree: P.1 A.1 Q.1 B.1 P.2\nloaded:\n"
           "stored: Error on Product Structure Instance (RefID 30) : Reference contains itself\n"
           "stored: Error on Product Structure Instance (RefID 60) : Reference contains itself\n"
           "debug: Error on RefID 30: Reference contains itself\n"
           "debug: Error on RefID 60: Reference contains itself\n"},
    {.name = "theDocument", // read before any instance: nothing guards it
     .faults = {once("TarvexDocumentInformation::GetAuthor", std::nullopt)},
     .off = "thrown: boom\ntree:\nloaded:\n"},
    // A part that fails is tried at each of its instances; its text is replaced, not added to.
    {.name = "modelerAnswersFalseWithAnError",
     .answer = Answer::FalseWithError,
     .off = "loaded: 40 50\nstored: Could not import Part 'PartP'. Failed with error : bad face\n"
            "debug: Error on RefID 10: bad face\ndebug: Error on RefID 10: bad face\n"},
    {.name = "modelerThrows",
     .answer = Answer::ThrowStd,
     .off = "loaded: 40 50\nstored: Error on Part Import (RefID 10) : modeler broke\n"
            "debug: Error on RefID 10: modeler broke\ndebug: Error on RefID 10: modeler broke\n"},
    {.name = "modelerThrowsNotAStdException",
     .answer = Answer::ThrowOther,
     .off = "loaded: 40 50\nstored: Part Import (RefID 10) Error : Unknown Exception\n"
            "debug: Error on RefID 10: Unknown exception while importing product structure\n"
            "debug: Error on RefID 10: Unknown exception while importing product structure\n"},
    {.name = "partDocumentWithAnUnhandledException",
     .faults = {once("TarvexInputPSReference::GetDocument", 40, kStd,
                     "Unhandled Exception\nno document\nmore")},
     .off = "loaded: 10 50\nstored: Part Import (RefID 40) Error : no document\n"
            "debug: Error on RefID 40: Unhandled Exception\nno document\nmore\n"},
    {.name = "pmiAfterTheContainerWasFiled",
     .faults = {once("TarvexPartImportResult::GetPMIData", std::nullopt)},
     .off = "stored: Error on Part Import (RefID 10) : boom\ndebug: Error on RefID 10: boom\n"},
    {.name = "visualisationImport",
     .faults = {once("TarvexVisualizationImporter::Import", 40, kOther)},
     .visu = true,
     .off = "loaded: 10 50\nstored: VisuData Import (RefID 40) Error : Unknown Exception\n"
            "debug: Error on RefID 40: Unknown exception while importing product structure\n"},
};

TEST(ImportFailure, IsStoredAndReportedWithTheThrowSwitchOffAndOn) {
    for (FailureCase const& c : kCases) {
        SCOPED_TRACE(c.name);
        EXPECT_EQ(run(c, false), c.off);
        EXPECT_EQ(run(c, true), c.on ? c.on : c.off);
    }
}

// The import's own failures show these forms too; here are the edges of the what text.
TEST(BuilderErrors, TextsTakeTheirFormFromTheWhatTextAndAreCutTo1023Characters) {
    struct Case {
        char const* what;
        WString expected;
    };
    std::string const longWhat(3000, 'x');
    Case const cases[] = {
        {"", u"Error on Stage (RefID 7) : "},
        {"Unhandled Exception in reader", u"Stage (RefID 7) Error : Unhandled Exception in reader"},
        {"first\nUnhandled Exception", u"Stage (RefID 7) Error : Unhandled Exception"},
        {"Unhandled Exception\n", u"Stage (RefID 7) Error : Unhandled Exception\n"},
        {"unhandled exception", u"Error on Stage (RefID 7) : unhandled exception"},
        {"caf\xE9", u"Error on Stage (RefID 7) : caf\u00E9"},
        {longWhat.c_str(), u"Error on Stage (RefID 7) : " + WString(996, u'x')}, // 1023 long
    };
    for (Case const& c : cases) {
        WString out = u"old";
        BuilderErrors::formatExceptionError(u"Stage", 7, std::runtime_error(c.what), out);
        EXPECT_EQ(out, c.expected) << c.what;
    }
    DebugCapture debug;
    BuilderErrors::reportDebugError(1, WString(3000, u'x'));
    EXPECT_EQ(debug.texts(), std::vector<WString>{u"Error on RefID 1: " + WString(1005, u'x')});
}

// --- The instance data phase

struct PhaseCase {
    char const* name;
    int toUse, physical = 2, used; ///< processors to use, there are, and used
    int count = 7;                 ///< the input's reference count once the tree is built
    bool modeler = true;
    bool visu = false;
    bool pmi = false;
    bool spoolerTrouble = false; ///< PartQ is delivered as 99, PartP's conversion fails
    char const* expected;
};

char const* const kScripted = "0/7\n"
                              "1/6 Importing Scripted BREP from PartP\n"
                              "2/6 Empty or invalid reference Empty\n"
                              "2/6 Importing Scripted BREP from PartQ\n"
                              "7/7\n"
                              "imported: 10 40, again:\n"
                              "stored: Missing File /lost/m.prt\n";

// What the spooler delivers is imported again, loaded or not.
char const* const kSpooler = "0/7\n"
                             "1/7 Importing Scripted BREP from PartQ\n"
                             "2/7 Importing Scripted BREP from PartP\n"
                             "imported: 40 10, again: 40 10\n"
                             "stored: Missing File /lost/m.prt\n";

// Unless a case says otherwise, the input counts 7 references once the tree is built. In the
// caller's process the first and last progress calls count the input's references and the others
// the structure's; a call counts the parts imported before it, and an empty sub-assembly is named.
// Through the spooler each delivered part is counted, and there is no closing call. With PMI on, a
// part without semantic PMI gets no visualisation import.
PhaseCase const kPhases[] = {
    {.name = "withoutModelerServices",
     .toUse = 1,
     .used = 1,
     .modeler = false,
     .expected = "0/7\n"
                 "1/6 Importing  BREP from PartP\n"
                 "2/6 Empty or invalid reference Empty\n"
                 "2/6 Importing  BREP from PartQ\n"
                 "3/6 Importing  BREP from PartP\n" // not loaded: tried again
                 "7/7\n"
                 "imported:, again:\n"
                 "stored: Could not import Part 'PartP'.\n"
                 "stored: Could not import Part 'PartQ'.\n"
                 "stored: Missing File /lost/m.prt\n"
                 "debug: VizBuilder: no modeler services are set, so no BREP part can be imported\n"
                 "debug: Error on RefID 10: \n"
                 "debug: Error on RefID 40: \n"
                 "debug: Error on RefID 10: \n"},
    {.name = "scripted", .toUse = 1, .used = 1, .expected = kScripted},
    {.name = "scriptedWithPMI", .toUse = 1, .used = 1, .pmi = true, .expected = kScripted},
    {.name = "onePhysicalProcessor", .toUse = 0, .physical = 1, .used = 1, .expected = kScripted},
    {.name = "oneReference",
     .toUse = 0,
     .used = 1,
     .count = 1,
     .expected = "0/1\n"
                 "1/6 Importing Scripted BREP from PartP\n"
                 "2/6 Empty or invalid reference Empty\n"
                 "2/6 Importing Scripted BREP from PartQ\n"
                 "1/1\n"
                 "imported: 10 40, again:\n"
                 "stored: Missing File /lost/m.prt\n"},
    {.name = "visualisationData",
     .toUse = 0,
     .used = 1,
     .modeler = false,
     .visu = true,
     .expected = "0/7\n"
                 "1/6 Importing VisuData from PartP\n"
                 "2/6 Empty or invalid reference Empty\n"
                 "2/6 Importing VisuData from PartQ\n"
                 "7/7\n"
                 "imported:, again:\n"
                 "stored: Missing File /lost/m.prt\n"},
    {.name = "spoolerWithPMI", .toUse = 2, .used = 2, .pmi = true, .expected = kSpooler},
    {.name = "spoolerOnMoreThanThereAre", .toUse = 4, .used = 4, .expected = kSpooler},
    {.name = "spoolerOnAll", .toUse = 0, .physical = 3, .used = 3, .expected = kSpooler},
    {.name = "spoolerTrouble",
     .toUse = 2,
     .used = 2,
     .spoolerTrouble = true,
     .expected = "0/7\n"
                 "1/7 Importing Scripted BREP from PartQ\n"
                 "imported: 40, again: 40\n"
                 "stored: Missing File /lost/m.prt\n"
                 "debug: MISMATCHING REFERENCE IDS\n\n"},
};

TEST(InstanceDataPhase, ProgressTextsAndResults) {
    for (PhaseCase const& c : kPhases) {
        SCOPED_TRACE(c.name);
        TarvexScopedProcessors const processors(c.toUse, c.physical);
        SharedProduct product;
        product.model.AddMissingFile(u"/lost/m.prt");
        product.model.SetSpoolerDeliveryOrder({40, 10, 50});
        if (c.spoolerTrouble) {
            product.model.SetSpoolerIdAlias(40, 99);
            product.model.FindReference(10)->geometry.conversionFails = true;
        }
        ImportRun run(product.model);
        product.model.SetUniqueReferencesCount(c.count);
        ScriptedModeler modeler;
        ProgressRecorder progress;
        DebugCapture debug;
        std::size_t reported = 0; // the modeler's calls so far, each on the caller's thread
        auto const imported = [&modeler, &reported] {
            std::string ids;
            for (; reported < modeler.calls().size(); ++reported) {
                ids += ' ' + std::to_string(modeler.calls()[reported].id);
                EXPECT_EQ(modeler.calls()[reported].thread, std::this_thread::get_id());
            }
            return ids;
        };
        run.builder.SetModelerServices(c.modeler ? &modeler : nullptr);
        run.builder.SetImportVisu(c.visu);
        run.builder.SetImportPMI(c.pmi);
        run.builder.SetProgressCallback(&ProgressRecorder::callback);

        EXPECT_TRUE(run.builder.ImportAndBuildPS());
        EXPECT_GT(run.builder.GetTotalImportBrepTime() + run.builder.GetTotalImportGeomTime(), 0);
        EXPECT_EQ(run.builder.GetNumberOfProcessorsUsed(), c.used);
        std::string const first = ProgressRecorder::text() + "imported:" + imported();
        std::string const stored = reportLines("stored: ", run.structure->GetErrorMessages());
        std::string const debugTexts = reportLines("debug: ", debug.texts());
        run.builder.ImportAndBuildPS(); // a second run starts from zeroed timers
        std::string const again = imported();
        if (c.modeler && again.empty()) {
            EXPECT_EQ(run.builder.GetTotalImportBrepTime() + run.builder.GetTotalImportGeomTime(),
                      0);
        }
        EXPECT_EQ(first + ", again:" + again + '\n' + stored + debugTexts, c.expected);
    }
}

TEST(InstanceDataPhase, ASpoolerFailureReachesTheCaller) {
    TarvexScopedProcessors const processors(2, 2);
    SharedProduct product;
    ImportRun run(product.model);
    product.model.Faults().Add(
        {"TarvexMultiProcessSpooler::HasDataAvailableFor", std::nullopt, kOther, "", 1});
    EXPECT_THROW(run.builder.ImportAndBuildPS(), TarvexForeignError);
}

TEST(InstanceDataPhase, EntitiesLeadDownToTheirPartContainer) {
    TarvexScopedProcessors const processors(1, 2);
    SharedProduct product;
    ImportRun run(product.model);
    ScriptedModeler modeler;
    run.builder.SetModelerServices(&modeler);
    run.builder.ImportAndBuildPS();
    TarvexInputPSReference const asm30 = run.input.GetReferenceFromId(30);
    TarvexInputPSReference const part10 = run.input.GetReferenceFromId(10);
    VizPartContainer* const part = run.structure->GetVizPartContainer(10);

    WString path;
    TarvexEntity const p2 = product.model.MakeEntity({product.b1Instance, product.p2Instance}, 7);
    EXPECT_EQ(VizBuilderTestPeer::partContainerOf(run.builder, asm30, p2, path), part);
    EXPECT_EQ(path, u"B.1/P.2");
    path = u"kept";
    TarvexEntity const none = product.model.MakeEntity({}, 7);
    EXPECT_EQ(VizBuilderTestPeer::partContainerOf(run.builder, asm30, none, path), nullptr);
    EXPECT_EQ(VizBuilderTestPeer::partContainerOf(run.builder, part10, none, path), part);
    EXPECT_EQ(path, u"kept") << "a part is its own container";
}

// --- The visualisation import

using KolbaVizCore::VizFace;
using KolbaVizCore::VizMesh;
using KolbaVizCore::VizPMI;
using Node = TarvexVisuNode;
using RGB = std::array<unsigned short, 3>;

/// A mesh leaf "<id>" of one triangle face "<id>/f"; mechanical ids "M-<id>" and "F-<id>".
TarvexAuthoredVisuNode mesh(std::u16string const& id,
                            TarvexVisuGeometryType geometry = TarvexVisuGeometry_Standard,
                            TarvexAuthoredVisuAttributes attributes = {}) {
    TarvexAuthoredVisuNode node;
    node.type = Node::VisuMesh;
    node.attributes = attributes;
    std::vector<float> const corners = {0, 0, 0, 1, 0, 0, 0, 1, 0},
                             normals = {0, 0, 1, 0, 0, 1, 0, 0, 1};
    TarvexAuthoredVisuPolygon const triangle{std::vector<int>{0, 3, 6}};
    TarvexAuthoredVisuFace const face{id + u"/f", u"F-" + id, corners, normals, {triangle}, {}, {}};
    node.mesh = {id, u"M-" + id, geometry, {face}, {}};
    return node;
}

/// A note "<id>" (mechanical id "P-<id>") with a leader line, linked to `links`.
TarvexAuthoredVisuNode note(std::u16string const& id, std::vector<char16_t const*> links = {}) {
    TarvexAuthoredVisuNode node;
    node.type = Node::VisuNote;
    node.pmi.id = id;
    node.pmi.mechanicalId = u"P-" + id;
    node.pmi.edges.push_back(
        {{}, {0, 0, 0, 5, 5, 0}, std::vector<int>{0, 3}, TarvexVisuLine_Polyline, {}, {}});
    for (char16_t const* link : links)
        node.pmi.linkedElements.push_back({{}, 0, link, true});
    return node;
}

std::string rgba(RGBAColor const& c) {
    return std::to_string(c.red) + ',' + std::to_string(c.green) + ',' + std::to_string(c.blue) +
           ',' + std::to_string(c.alpha);
}

/// A line: "<kind> <visual id>", then the mesh's own colour, its hidden state and the colour
/// of its face where it has them.
std::string line(char const* kind, VizMesh const& mesh) {
    std::string out = kind + (' ' + VizPort::Narrow(mesh.GetVisualID()));
    if (mesh.HasColor())
        out += " colour " + rgba(mesh.GetColor());
    if (mesh.GetHidden())
        out += " hidden";
    if (VizFace const* face = mesh.GetFaces().at(0); face->HasColor())
        out += " face " + rgba(face->GetColor());
    return out + '\n';
}

/// What the structure holds for `id`: each container and its elements, list by list.
std::string describe(VizProductStructure const& s, int id) {
    std::string out;
    if (VizContainer const* viz = s.GetVizContainer(id)) {
        out += "VizContainer\n";
        for (VizMesh const* m : viz->GetMeshes())
            out += line("mesh", *m);
        for (VizMesh const* m : viz->GetCGMeshes())
            out += line("cg mesh", *m);
    }
    if (VizPMIContainer const* pmi = s.GetVizPMIContainer(id)) {
        out += "VizPMIContainer\n";
        for (VizMesh const* m : pmi->GetVizFTACGMeshes())
            out += line("fta mesh", *m);
        for (VizPMI const* p : pmi->GetVizPMIs()) {
            out += "pmi " + VizPort::Narrow(p->GetVisualID()) + ": " +
                   std::to_string(p->GetEdges().size()) + " edges, " +
                   std::to_string(p->GetFaces().size()) + " faces, " +
                   std::to_string(p->GetTexts().size()) + " texts, links";
            for (std::u16string const& link : p->GetLinkedEntityMechIDs())
                out += " [" + VizPort::Narrow(link) + ']';
            out += '\n';
        }
    }
    return out + reportLines("stored: ", s.GetErrorMessages());
}

enum class Road { VisuAndPMI, VisuOnly, PMIOnly, Neither, TessellatedText };

/// Imports the visualisation data of PartP (10) of the shared product on `road` and describes
/// what came of it. The roads that import PMI without tessellated geometry, or that have
/// neither, call the builder's steps directly.
std::string importPartP(std::vector<TarvexAuthoredVisuNode> nodes, Road road) {
    SharedProduct product;
    product.model.FindReference(10)->visu.nodes = std::move(nodes);
    ImportRun run(product.model);
    run.structure->SetTesselatingText(road == Road::TessellatedText);
    run.builder.SetImportVisu(road != Road::PMIOnly && road != Road::Neither);
    run.builder.SetImportPMI(road != Road::VisuOnly && road != Road::Neither);
    TarvexInputPSReference const reference = run.input.GetReferenceFromId(10);
    if (road == Road::PMIOnly) {
        TarvexVisuData const data =
            TarvexVisualizationImporter().Import(reference.GetDocument()).GetVisualizationData();
        VizContainer* viz = nullptr;
        VizPMIContainer* pmi = nullptr;
        VizBuilderTestPeer::graphicalContainer(run.builder, 10, data, viz, pmi);
        EXPECT_EQ(viz, nullptr);
        VizProductStructureTestPeer::addPMIContainer(*run.structure, 10, pmi);
    } else if (road == Road::Neither) {
        VizBuilderTestPeer::importVisuData(run.builder, reference);
    } else {
        run.builder.ImportAndBuildPS();
    }
    return describe(*run.structure, 10);
}

TEST(VisuDataImport, TheSwitchesAndGeometryTypesChooseTheLists) {
    // n1 links the face of m1, the note n2 that comes after it, the face of the FTA mesh m4
    // and an id that nothing has. A link resolves only to what was loaded for a VizContainer.
    TarvexAuthoredVisuNode n2 = note(u"n2");
    TarvexAuthoredVisuFont const font{u"DejaVu Sans", 5.0f, 1.0f, 1.0f};
    n2.pmi.texts.push_back({u"AB", {0, 0, 0}, {1, 0, 0}, {0, 0, 1}, font, {}, {}});
    std::vector<TarvexAuthoredVisuNode> const nodes = {
        mesh(u"m1"),
        mesh(u"m2", TarvexVisuGeometry_Unknown),
        mesh(u"m3", TarvexVisuGeometry_Constructed),
        mesh(u"m4", TarvexVisuGeometry_FTAConstructed),
        note(u"n1", {u"m1/f", u"n2", u"m4/f", u"nowhere"}),
        n2};
    std::string const meshes = "VizContainer\nmesh m1\nmesh m2\ncg mesh m3\n";
    std::string const n1 = "pmi n1: 1 edges, 0 faces, 0 texts, links [F-m1] [P-n2] [F-m4] []\n";
    EXPECT_EQ(importPartP(nodes, Road::VisuAndPMI),
              meshes + "VizPMIContainer\nfta mesh m4\n" + n1 +
                  "pmi n2: 1 edges, 0 faces, 1 texts, links\n");
    // The structure's switch tessellates texts: the leader, then the outlines of the letters,
    // and one filled glyph per letter.
    EXPECT_EQ(importPartP(nodes, Road::TessellatedText),
              meshes + "VizPMIContainer\nfta mesh m4\n" + n1 +
                  "pmi n2: 6 edges, 2 faces, 0 texts, links\n");
    EXPECT_EQ(importPartP(nodes, Road::VisuOnly), meshes);
    EXPECT_EQ(importPartP(nodes, Road::PMIOnly),
              "VizPMIContainer\n"
              "fta mesh m4\n"
              "pmi n1: 1 edges, 0 faces, 0 texts, links [] [P-n2] [] []\n"
              "pmi n2: 1 edges, 0 faces, 1 texts, links\n");
    EXPECT_EQ(importPartP(nodes, Road::Neither), "stored: Could not Import VisuData from PartP\n");
}

// A node's own attributes reach its top element, and its faces through the attribute stack.
// A group's attributes stay on the stack for the rest of the walk, a leaf's only for itself.
TEST(VisuDataImport, AttributesComeFromTheNodeAndTheGroupsBeforeIt) {
    TarvexAuthoredVisuNode group;
    group.type = Node::VisuGroup;
    group.leaf = false;
    group.attributes.rgb = RGB{200, 0, 0};
    TarvexAuthoredVisuNode notALeaf = mesh(u"skipped");
    notALeaf.leaf = false;
    TarvexVisuGeometryType const standard = TarvexVisuGeometry_Standard;
    EXPECT_EQ(importPartP({mesh(u"m1", standard, {false, {}, 0x1280, {}}),
                           mesh(u"m2", standard, {true, RGB{10, 20, 0x130}, {}, {}}), mesh(u"m3"),
                           group, mesh(u"m4"), mesh(u"m5", standard, {{}, RGB{0, 200, 0}, {}, {}}),
                           mesh(u"m6"), notALeaf},
                          Road::VisuOnly),
              "VizContainer\n"
              "mesh m1 colour 0,0,0,128 face 0,0,0,128\n" // only the low byte counts
              "mesh m2 colour 10,20,48,255 hidden face 10,20,48,255\n"
              "mesh m3\n"
              "mesh m4 face 200,0,0,255\n"
              "mesh m5 colour 0,200,0,255 face 0,200,0,255\n"
              "mesh m6 face 200,0,0,255\n");
}

// Run under the sanitizers: if the failed walk's ids stayed in the visual id map, PartQ's
// note would read the freed mesh of PartP while its links are resolved.
TEST(VisuDataImport, AWalkThatThrowsLeavesNoIdOfItsFreedElements) {
    SharedProduct product;
    product.model.FindReference(10)->visu.nodes = {mesh(u"m1"), note(u"n1")};
    product.model.FindReference(40)->visu.nodes = {note(u"c1", {u"m1/f", u"n1"})};
    // The walk of PartP breaks at its second node, after the mesh was entered.
    product.model.Faults().Add({"TarvexVisuNodeIter::Current", 10, kStd, "node broke", 1});
    ImportRun run(product.model);
    run.builder.SetImportVisu(true);
    run.builder.SetImportPMI(true);
    run.builder.ImportAndBuildPS();
    EXPECT_EQ(describe(*run.structure, 10),
              "stored: Error on VisuData Import (RefID 10) : node broke\n");
    EXPECT_EQ(describe(*run.structure, 40),
              "VizContainer\nVizPMIContainer\npmi c1: 1 edges, 0 faces, 0 texts, links [] []\n"
              "stored: Error on VisuData Import (RefID 10) : node broke\n");
}

} // namespace
} // namespace VizBridgeTarvex
