#pragma once

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/stepinput/LeakCheckPause.h>
#include <VizBridge/stepinput/StepDocument.h>
#include <VizBridge/stepinput/XcafDocument.h>

#include <BRepPrimAPI_MakeBox.hxx>
#include <Message.hxx>
#include <Message_Messenger.hxx>
#include <STEPCAFControl_Writer.hxx>
#include <STEPControl_Writer.hxx>
#include <TDataStd_Name.hxx>
#include <TDocStd_Document.hxx>
#include <XCAFApp_Application.hxx>
#include <XCAFDoc_DocumentTool.hxx>
#include <XCAFDoc_ShapeTool.hxx>
#include <gp.hxx>
#include <gp_Trsf.hxx>

#include <filesystem>
#include <fstream>
#include <map>
#include <memory>
#include <sstream>
#include <string>
#include <unistd.h>

namespace VizBridgeStep {

/// The STEP files of the tests: the CTC models, read once per run, and files written for a
/// test into a scratch folder of this process.
class StepTestFiles {
public:
    static constexpr double kFixtureX = 500.0; ///< where the assembly places its fixture
    static constexpr double kRightY = 300.0;   ///< where the fixture places its right part

    static std::string Data(std::string const& file) {
        return std::string(VIZBRIDGE_TEST_DATA) + "/step-pmi/" + file;
    }

    /// A CTC model, read once for the whole run.
    static StepDocument& CTC(std::string const& file) {
        static std::map<std::string, std::shared_ptr<StepDocument>> read;
        std::shared_ptr<StepDocument>& document = read[file];
        if (!document)
            document = StepDocument::Read(Data(file));
        return *document;
    }

    static std::unique_ptr<VizBridgeTarvex::VizProductStructure>
    Structure(StepDocument const& step) {
        TarvexPSImportResult const result = step.Model().GetImportResult();
        TarvexInputProductStructure const input = step.Model().GetInputProductStructure();
        TarvexDocument document = step.Model().GetDocument();
        return VizBridgeTarvex::MakeUniqueVizProductStructure(result, input, document);
    }

    /// The mesh of reference `id`'s visualisation data.
    static TarvexAuthoredVisuMesh const& Mesh(StepDocument& step, unsigned int id) {
        return step.Model().FindReference(id)->visu.nodes.front().mesh;
    }

    /// A path in this process's scratch folder.
    static std::string Scratch(std::string const& name) {
        static std::filesystem::path const folder = [] {
            std::filesystem::path made = std::filesystem::temp_directory_path() /
                                         ("vizbridge-step-" + std::to_string(getpid()));
            std::filesystem::create_directories(made);
            return made;
        }();
        return (folder / name).string();
    }

    /// "Bench": a fixture (placed at x 500) holding CTC 01 twice, at identity ("Left") and
    /// a quarter turn about z at y 300 ("Right"), and CTC 03 once ("Alone"), written through
    /// Open CASCADE's STEP writer and read back.
    static StepDocument& Assembly() {
        static std::shared_ptr<StepDocument> const read = [] {
            XcafDocument const document;
            Handle(TDocStd_Document) const doc = document.Get();
            Handle(XCAFDoc_ShapeTool) const shapes = XCAFDoc_DocumentTool::ShapeTool(doc->Main());
            auto const named = [](TDF_Label const& label, char const* name) {
                TDataStd_Name::Set(label, name);
                return label;
            };
            TDF_Label const ctc1 =
                named(shapes->AddShape(Part("nist_ctc_01_asme1_ap242-e1.stp"), false), "CTC1");
            TDF_Label const ctc3 =
                named(shapes->AddShape(Part("nist_ctc_03_asme1_ap242-e2.stp"), false), "CTC3");
            TDF_Label const fixture = named(shapes->NewShape(), "Fixture");
            named(shapes->AddComponent(fixture, ctc1, TopLoc_Location()), "Left");
            gp_Trsf turned;
            turned.SetRotation(gp::OZ(), M_PI / 2);
            turned.SetTranslationPart(gp_Vec(0, kRightY, 0));
            named(shapes->AddComponent(fixture, ctc1, TopLoc_Location(turned)), "Right");
            TDF_Label const bench = named(shapes->NewShape(), "Bench");
            gp_Trsf moved;
            moved.SetTranslation(gp_Vec(kFixtureX, 0, 0));
            named(shapes->AddComponent(bench, fixture, TopLoc_Location(moved)), "Fixture.1");
            named(shapes->AddComponent(bench, ctc3, TopLoc_Location()), "Alone");
            shapes->UpdateAssemblies();

            std::string const path = Scratch("bench.stp");
            QuietWriter const quiet;
            STEPCAFControl_Writer writer;
            writer.Transfer(doc, STEPControl_AsIs);
            writer.Write(path.c_str());
            return StepDocument::Read(path);
        }();
        return *read;
    }

    /// The text of a STEP file of a 10 x 20 x 30 box.
    static std::string BoxFile() {
        std::string const path = Scratch("box.stp");
        QuietWriter const quiet;
        STEPControl_Writer writer;
        writer.Transfer(BRepPrimAPI_MakeBox(10, 20, 30).Shape(), STEPControl_AsIs);
        writer.Write(path.c_str());
        std::ostringstream text;
        text << std::ifstream(path).rdbuf();
        return text.str();
    }

    /// A well-formed STEP file with nothing in its data section.
    static std::string EmptyDataFile() {
        return "ISO-10303-21;\nHEADER;\nFILE_DESCRIPTION((''),'2;1');\n"
               "FILE_NAME('nothing.stp','',(''),(''),'','','');\n"
               "FILE_SCHEMA(('AP242_MANAGED_MODEL_BASED_3D_ENGINEERING_MIM_LF'));\nENDSEC;\n"
               "DATA;\nENDSEC;\nEND-ISO-10303-21;\n";
    }

private:
    /// Takes Open CASCADE's printers away while a writer runs: its statistics are no test's
    /// business. The writer also makes a default placement that it keeps for the whole
    /// process, which leak checks leave out.
    class QuietWriter {
    public:
        QuietWriter() : m_printers(Message::DefaultMessenger()->Printers()) {
            Message::DefaultMessenger()->ChangePrinters().Clear();
        }
        ~QuietWriter() { Message::DefaultMessenger()->ChangePrinters() = m_printers; }
        QuietWriter(QuietWriter const&) = delete;
        QuietWriter& operator=(QuietWriter const&) = delete;

    private:
        Message_SequenceOfPrinters m_printers;
        LeakCheckPause m_pause;
    };

    static TopoDS_Shape Part(std::string const& file) { return CTC(file).Parts().front().shape; }
};

} // namespace VizBridgeStep
