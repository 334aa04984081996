#pragma once

#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/stepinput/StepPart.h>
#include <VizBridge/stepinput/StepReadOptions.h>

#include <memory>
#include <string>
#include <vector>

namespace VizBridgeStep {

/// What a STEP file holds, counted as a careful reader of the file counts it.
struct StepCounts {
    int parts = 0;
    int assemblies = 0;
    int instances = 0;
    int faces = 0;             ///< of all parts, each part counted once
    int triangles = 0;         ///< of the parts' meshes
    int pmi = 0;               ///< annotations with graphical PMI
    int views = 0;             ///< saved views
    int gdtObjects = 0;        ///< semantic dimensions, tolerances and datums
    int gdtFaceReferences = 0; ///< faces that they refer to, once per object
    int gdtResolvedFaces = 0;  ///< of those, the faces that have an id in a part
};

/// A STEP AP203/AP214/AP242 file read through Open CASCADE into the import library's model:
/// the product structure, the document strings, each part's tessellated visualisation data
/// (faces, edges, supplemental geometry), its graphical PMI and the file's saved views, and
/// the parts' BREP, kept here for the Open CASCADE modeler.
///
/// Owns the model and the parts. Value objects of the model that were handed out share its
/// data and may outlive the document; the modeler services made on a document share it.
class StepDocument {
public:
    /// Reads `path`. Throws StepReadError with a one-line message for a file that cannot be
    /// read; Open CASCADE prints nothing.
    static std::shared_ptr<StepDocument> Read(std::string const& path,
                                              StepReadOptions const& options = {});

    StepDocument(StepDocument const&) = delete;
    StepDocument& operator=(StepDocument const&) = delete;
    ~StepDocument();

    TarvexModel const& Model() const { return m_model; }
    TarvexModel& Model() { return m_model; }

    std::vector<StepPart> const& Parts() const { return m_parts; }
    /// The part of reference `referenceId`, or null.
    StepPart const* FindPart(unsigned int referenceId) const;

    StepCounts const& Counts() const { return m_counts; }
    /// What the file holds that the model cannot take, one line each.
    std::vector<std::string> const& Notes() const { return m_notes; }
    std::string const& Schema() const { return m_schema; }

private:
    StepDocument() = default;
    /// The reading itself, under the reader lock; Open CASCADE's exceptions pass.
    void readLocked(std::string const& path, StepReadOptions const& options);

    TarvexModel m_model;
    std::vector<StepPart> m_parts;
    StepCounts m_counts;
    std::vector<std::string> m_notes;
    std::string m_schema;
};

} // namespace VizBridgeStep
