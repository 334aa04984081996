// The graphical PMI and the saved views of the NIST CTC models, as a careful reader of each
// file counts them.
#include "StepTestFiles.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <set>
#include <sstream>

namespace VizBridgeStep {
namespace {

struct PMICase {
    char const* file;
    int annotations; ///< tessellated annotations, each showing one GD&T object
    int polylines;
    int glyphTriangles;
    int gdtObjects;       ///< dimensions, tolerances and datums of the semantic GD&T
    int gdtFaces;         ///< face references of those objects
    char const* types;    ///< node type: annotations of it
    char const* captures; ///< name: annotations shown, one view per line
};

PMICase const kCases[] = {
    {"nist_ctc_01_asme1_ap242-e1.stp", 23, 146, 2735, 29, 43,
     "13:2 17:3 21:2 23:1 25:9 35:1 39:2 41:1 43:2", "MBD_0:23\n"},
    {"nist_ctc_02_asme1_ap242-e2.stp", 46, 346, 10132, 116, 55,
     "13:2 17:6 18:9 25:7 35:1 38:1 39:13 41:3 43:4", "MBD_A:14\nMBD_B:15\nMBD_C:24\n"},
    {"nist_ctc_03_asme1_ap242-e2.stp", 29, 219, 5015, 48, 60,
     "17:6 21:1 22:1 25:8 35:1 39:3 40:1 41:2 43:6", "MBD_0:29\n"},
};

TEST(StepPMI, EachAnnotationIsAPMILinkedToFacesOfItsPartAndEachViewACapture) {
    for (PMICase const& c : kCases) {
        SCOPED_TRACE(c.file);
        StepDocument& step = StepTestFiles::CTC(c.file);
        StepPart const& part = step.Parts().front();
        TarvexAuthoredReference const& reference = *step.Model().FindReference(part.referenceId);
        std::string const prefix = std::to_string(part.referenceId) + ".";

        EXPECT_EQ(step.Counts().gdtObjects, c.gdtObjects);
        EXPECT_EQ(step.Counts().gdtFaceReferences, c.gdtFaces);
        EXPECT_EQ(step.Counts().gdtResolvedFaces, c.gdtFaces) << "every face reference resolves";

        int annotations = 0, polylines = 0, triangles = 0;
        std::map<int, int> types;
        std::set<std::string> ids;
        for (TarvexAuthoredVisuNode const& node : reference.visu.nodes) {
            if (node.type < TarvexVisuNode::VisuPMI)
                continue;
            ++annotations;
            ++types[node.type];
            ids.insert(VizPort::Narrow(*node.pmi.id));
            polylines += static_cast<int>(node.pmi.edges.size());
            for (TarvexAuthoredVisuText const& text : node.pmi.texts)
                for (TarvexAuthoredVisuFace const& glyph : text.glyphs->faces)
                    triangles += static_cast<int>(glyph.polygons.front().indices->size() / 3);
            // Every link names a face of the part, under the id both roads give it.
            for (TarvexAuthoredEntity const& linked : node.pmi.linkedElements) {
                EXPECT_GE(linked.entityId, 1u);
                EXPECT_LE(linked.entityId, static_cast<unsigned int>(part.faces.Extent()));
                EXPECT_EQ(VizPort::Narrow(*linked.visualId),
                          prefix + std::to_string(linked.entityId));
            }
        }
        EXPECT_EQ(annotations, c.annotations);
        EXPECT_EQ(step.Counts().pmi, c.annotations);
        EXPECT_EQ(polylines, c.polylines);
        EXPECT_EQ(triangles, c.glyphTriangles);
        std::string typeText;
        for (auto const& [type, count] : types)
            typeText +=
                (typeText.empty() ? "" : " ") + std::to_string(type) + ":" + std::to_string(count);
        EXPECT_EQ(typeText, c.types);

        // A view shows annotations of the part, and keeps the camera of the file: a position
        // away from the origin, which Open CASCADE alone reads as the origin.
        std::ostringstream captures;
        for (TarvexAuthoredVisuCapture const& capture : reference.visu.captures) {
            captures << VizPort::Narrow(*capture.displayName) << ":" << capture.annotationIds.size()
                     << "\n";
            for (VizPort::WString const& id : capture.annotationIds)
                EXPECT_EQ(ids.count(VizPort::Narrow(id)), 1u) << VizPort::Narrow(id);
            std::array<float, 3> const& eye = capture.camera.orientation->front();
            EXPECT_GT(std::abs(eye[0]) + std::abs(eye[1]) + std::abs(eye[2]), 100.f);
        }
        EXPECT_EQ(captures.str(), c.captures);
        EXPECT_EQ(step.Counts().views, static_cast<int>(reference.visu.captures.size()));
    }
}

// One coordinate list of CTC 01 keeps a single point and then names the draughting model, so
// that the records point in a circle: model, annotation, curve set, coordinates, model. The
// annotation loses its lines; everything read is freed again, which the sanitized run checks.
TEST(StepPMI, CoordinatesThatPointBackAtTheirModelLoseTheirLinesAndAreFreed) {
    std::ifstream ctc1(StepTestFiles::Data(kCases[0].file), std::ios::binary);
    std::string circle, line;
    while (std::getline(ctc1, line))
        circle += (line.rfind("#408=", 0) == 0
                       ? "#408=COORDINATES_LIST('diameter dimension',1,((245.6,103.0,0.),#630));"
                       : line) +
                  "\n";
    std::string const path = StepTestFiles::Scratch("circle.stp");
    std::ofstream(path, std::ios::binary) << circle;

    std::shared_ptr<StepDocument> const step = StepDocument::Read(path);
    EXPECT_EQ(step->Counts().pmi, kCases[0].annotations);
    std::vector<std::string> const& notes = step->Notes();
    EXPECT_NE(std::find(notes.begin(), notes.end(),
                        "annotation 'Linear Size.8' (#522): 256 indices past its coordinates are "
                        "left out"),
              notes.end());
}

} // namespace
} // namespace VizBridgeStep
