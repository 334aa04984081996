// The STEP reader on the NIST CTC models, on an assembly written from their parts, and on
// files that are not what they claim.
#include "StepTestFiles.h"

#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/render/UniqueRenderer.h>
#include <VizBridge/stepinput/StepReadError.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>

namespace VizBridgeStep {
namespace {

using VizBridgeTarvex::VizProductStructure;

struct ModelCase {
    char const* file;
    char const* tree;  ///< VizProductStructure::ToString
    int faces;         ///< of the one part
    char const* color; ///< of the part, sRGB
    char const* document;
};

// What a careful reader of each file finds: one part, its faces (CTC 02 has two one-face
// shells beside its solid), its colour as the file gives it, millimetres, the header.
ModelCase const kModels[] = {
    {"nist_ctc_01_asme1_ap242-e1.stp",
     "Product: nist_ctc_01_asme1_ap242-e1\n"
     "   Part: instance: NIST Complex Test Case 1 of reference: NIST Complex Test Case 1\n",
     117, "192,169,249", "nist_ctc_01_asme1_ap242-e1.stp|mm"},
    {"nist_ctc_02_asme1_ap242-e2.stp",
     "Product: nist_ctc_02_asme1_ap242-e2\n"
     "   Part: instance: Test Case 2 Baseline of reference: Test Case 2 Baseline\n",
     637, "210,210,255", "nist_ctc_02_asme1_ap242-e2.stp|mm"},
    {"nist_ctc_03_asme1_ap242-e2.stp",
     "Product: nist_ctc_03_asme1_ap242-e2\n"
     "   Part: instance: Test Case 3 Baseline of reference: Test Case 3 Baseline\n",
     120, "210,210,255", "nist_ctc_03_asme1_ap242-e2.stp|mm"},
};

std::string bytes(std::optional<std::array<std::uint8_t, 3>> const& color) {
    return color ? std::to_string((*color)[0]) + "," + std::to_string((*color)[1]) + "," +
                       std::to_string((*color)[2])
                 : "none";
}

TEST(StepDocument, ReadsWhatACarefulReaderFindsInTheCTCModels) {
    for (ModelCase const& c : kModels) {
        SCOPED_TRACE(c.file);
        StepDocument& step = StepTestFiles::CTC(c.file);
        std::unique_ptr<VizProductStructure> const structure = StepTestFiles::Structure(step);
        EXPECT_EQ(VizPort::Narrow(structure->ToString()), c.tree);
        EXPECT_EQ(VizPort::Narrow(structure->GetFileName() + u"|" + structure->GetDocumentUnits()),
                  c.document);
        EXPECT_EQ(structure->GetUnits(), u"mm");
        ASSERT_EQ(step.Parts().size(), 1u);
        StepPart const& part = step.Parts().front();
        EXPECT_EQ(part.faces.Extent(), c.faces);
        EXPECT_EQ(step.Counts().faces, c.faces);
        EXPECT_EQ(bytes(part.color), c.color);
        EXPECT_FALSE(part.supplemental.IsNull()) << "each file holds supplemental geometry";
        EXPECT_EQ(step.Schema(), "AP242_MANAGED_MODEL_BASED_3D_ENGINEERING_MIM_LF");

        // Every face reaches the visualisation data under its id, with its triangles.
        TarvexAuthoredVisuMesh const& mesh = StepTestFiles::Mesh(step, part.referenceId);
        ASSERT_EQ(mesh.faces.size(), static_cast<std::size_t>(c.faces));
        for (std::size_t i = 0; i < mesh.faces.size(); ++i)
            EXPECT_EQ(mesh.faces[i].mechanicalId, VizPort::Widen(std::to_string(i + 1)));
        EXPECT_GT(step.Counts().triangles, c.faces);
    }
}

// A surface style of CTC 01 names a triangulated set for its side style. Open CASCADE's colour
// reading would follow it unchecked; the file is read without colours instead, and says so.
TEST(StepDocument, ABrokenSurfaceStyleLeavesTheColoursOutAndSaysSo) {
    std::ifstream ctc1(StepTestFiles::Data(kModels[0].file), std::ios::binary);
    std::string text, line;
    while (std::getline(ctc1, line))
        text += (line.rfind("#3455=", 0) == 0 ? "#3455=SURFACE_STYLE_USAGE(.BOTH.,#345);" : line) +
                "\n";
    std::string const path = StepTestFiles::Scratch("style.stp");
    std::ofstream(path, std::ios::binary) << text;

    std::shared_ptr<StepDocument> const step = StepDocument::Read(path);
    EXPECT_EQ(bytes(step->Parts().front().color), "none");
    EXPECT_EQ(step->Counts().faces, kModels[0].faces);
    std::vector<std::string> const& notes = step->Notes();
    EXPECT_NE(
        std::find(notes.begin(), notes.end(), "colours are not read: the style #3455 is broken"),
        notes.end());
}

TEST(StepDocument, AnAssemblyWrittenFromThePartsImportsEachPartOnceAndComposesPlacements) {
    StepDocument const& step = StepTestFiles::Assembly();
    EXPECT_EQ(step.Counts().parts, 2);
    EXPECT_EQ(step.Counts().assemblies, 1);
    EXPECT_EQ(step.Counts().instances, 4);
    std::unique_ptr<VizProductStructure> const structure = StepTestFiles::Structure(step);
    EXPECT_EQ(VizPort::Narrow(structure->ToString()),
              "Product: Bench\n"
              "   Product: instance: Fixture.1 of reference: Fixture\n"
              "      Part: instance: Left of reference: CTC1\n"
              "      Part: instance: Right of reference: CTC1\n"
              "   Part: instance: Alone of reference: CTC3\n");

    TarvexScopedProcessors const processors(1, std::nullopt);
    TarvexInputProductStructure const input = step.Model().GetInputProductStructure();
    VizBridgeTarvex::VizBuilder builder(*structure, input, nullptr);
    builder.SetImportVisu(true);
    builder.ImportAndBuildPS();
    EXPECT_EQ(structure->GetErrorMessages(), std::vector<VizPort::WString>());
    EXPECT_EQ(structure->GetNumberOfVizContainers(), 2);

    KolbaVizCore::SceneBuilder scene;
    scene.SetGeometryItemFactory(std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    auto const renderer = VizBridgeTarvex::MakeUniqueRenderer(structure.get(), nullptr, &scene);
    ASSERT_TRUE(renderer->Render());
    std::string const dump = scene.Dump();
    std::size_t references = 0;
    for (std::size_t at = dump.find("-> ref"); at != std::string::npos;
         at = dump.find("-> ref", at + 1))
        ++references;
    EXPECT_EQ(references, 1u) << "the second instance of CTC1 refers to the first drawing";

    // "Right" stands at the fixture's placement times its own.
    VizBridgeTarvex::VizPSEntry const* const right =
        structure->GetChildren().front()->GetChildren().back();
    VizBridgeTarvex::RenderId path;
    ASSERT_TRUE(right->Get3DRenderID(path));
    KolbaVizCore::Matrix4 world;
    ASSERT_TRUE(scene.GetWorldTransform(path, world));
    double const origin[3] = {0, 0, 0};
    double placed[3];
    world.ApplyToPoint(origin, placed);
    EXPECT_NEAR(placed[0], StepTestFiles::kFixtureX, 1e-9);
    EXPECT_NEAR(placed[1], StepTestFiles::kRightY, 1e-9);
    double const alongX[3] = {1, 0, 0};
    world.ApplyToPoint(alongX, placed);
    EXPECT_NEAR(placed[1], StepTestFiles::kRightY + 1.0, 1e-9) << "turned a quarter about z";
}

TEST(StepDocument, RefusesFilesThatAreNotWhatTheyClaimWithOneLine) {
    struct BadCase {
        char const* name;
        std::string content; ///< of the file; "missing.stp" is not made
        std::string error;   ///< after "<path>: "
    };
    std::string const valid = StepTestFiles::BoxFile();
    // The solid's shell goes, while the solid still points at it.
    std::size_t const shell = valid.find("CLOSED_SHELL(");
    std::size_t const shellLine = valid.rfind('\n', shell) + 1;
    std::size_t const shellEnd = valid.find('\n', shell) + 1;
    std::string const dangling = valid.substr(0, shellLine) + valid.substr(shellEnd);
    // The shell's first face names an entity that the file does not hold.
    std::string faceGone = valid;
    std::size_t const firstFace = faceGone.find('#', faceGone.find("CLOSED_SHELL(")) + 1;
    faceGone.replace(firstFace, faceGone.find_first_not_of("0123456789", firstFace) - firstFace,
                     "999999");
    // CTC 03 without the records of its file lines 766 to 1855 (annotation coordinates,
    // validation properties and more), which the records left still point at.
    std::ifstream ctc3(StepTestFiles::Data("nist_ctc_03_asme1_ap242-e2.stp"), std::ios::binary);
    std::string cut, line;
    for (int number = 1; std::getline(ctc3, line); ++number)
        if (number < 766 || number > 1855)
            cut += line + "\n";
    // A line whose point is its vector: Open CASCADE cannot read the line's point.
    std::string broken = valid;
    std::size_t const lineAt = broken.find("LINE('',#") + 9;
    std::size_t const comma = broken.find(',', lineAt);
    broken.replace(lineAt, comma - lineAt,
                   broken.substr(comma + 2, broken.find(')', comma) - comma - 2));
    // A name given twice, after names inside a comment and a string that count for nothing.
    std::size_t const dataEnd = valid.rfind("ENDSEC;");
    std::string const dataEndLine =
        std::to_string(std::count(valid.begin(), valid.begin() + dataEnd, '\n') + 1);
    std::string twice = valid;
    twice.insert(dataEnd, "/* #90003=X(); */ #90004=X(';#90003=X();'); #90003=X(); #90004=X();\n");
    std::string nameless = valid;
    nameless.insert(dataEnd, "#90004=X(); X(#90004);\n");
    std::string openString = valid;
    openString.insert(dataEnd, "#90004=X('the rest of the file);\n");
    std::string wrongSchema = valid;
    std::size_t const schemaAt = wrongSchema.find("FILE_SCHEMA");
    wrongSchema.replace(schemaAt, wrongSchema.find(';', schemaAt) - schemaAt,
                        "FILE_SCHEMA(('IFC2X3'))");

    BadCase const cases[] = {
        {"missing.stp", "", "cannot open the file: No such file or directory"},
        {"empty.stp", "", "the file is empty"},
        {"binary.stp",
         std::string("\x7f"
                     "ELF\0\0\0",
                     7),
         "not a STEP file (binary content)"},
        {"text.stp", "solid cube\nendsolid\n",
         "not a STEP file (it does not begin with ISO-10303-21;)"},
        {"truncated.stp", valid.substr(0, valid.size() / 2),
         "the file is truncated (no END-ISO-10303-21;)"},
        {"ifc.stp", wrongSchema, "the schema IFC2X3 is not one of AP203, AP214 or AP242"},
        {"dangling.stp", dangling,
         "its geometry is broken at #15 (Parameter n0.2 (outer) : Entity has illegal type)"},
        {"cut.stp", cut,
         "its geometry is broken at #97 (Parameter n0.3 "
         "(shape_aspect_relationship.relating_shape_aspect) : Entity has illegal type)"},
        {"face-gone.stp", faceGone,
         "its geometry is broken at #16 (Parameter n0.1 (face) : Entity has illegal type)"},
        {"broken.stp", broken,
         "its geometry is broken at #27 (Parameter n0.2 (pnt) : Entity has illegal type)"},
        {"nothing.stp", StepTestFiles::EmptyDataFile(), "the file holds no entity"},
        {"twice.stp", twice, "the entity name #90004 is given twice (line " + dataEndLine + ")"},
        {"nameless.stp", nameless,
         "a record does not begin with an entity name #<number>= (line " + dataEndLine + ")"},
        {"open-string.stp", openString, "a string is never closed (line " + dataEndLine + ")"},
    };
    for (BadCase const& c : cases) {
        SCOPED_TRACE(c.name);
        std::string const path = StepTestFiles::Scratch(c.name);
        if (std::string(c.name) != "missing.stp")
            std::ofstream(path, std::ios::binary) << c.content;
        testing::internal::CaptureStdout();
        testing::internal::CaptureStderr();
        std::string error = "read without complaint";
        try {
            StepDocument::Read(path);
        } catch (StepReadError const& e) {
            error = e.what();
        }
        EXPECT_EQ(testing::internal::GetCapturedStdout() + testing::internal::GetCapturedStderr(),
                  "")
            << "Open CASCADE says nothing while it reads";
        EXPECT_EQ(error, path + ": " + c.error);
    }
}

} // namespace
} // namespace VizBridgeStep
