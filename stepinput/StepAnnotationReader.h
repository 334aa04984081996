#pragma once

#include <VizBridge/stepinput/StepDocument.h>
#include <VizBridge/stepinput/StepUnboundItems.h>

#include <Standard_Transient.hxx>
#include <TopoDS_TShape.hxx>
#include <XSControl_WorkSession.hxx>

#include <map>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

namespace VizBridgeStep {

/// Turns the graphical PMI of a STEP AP242 file, its tessellated annotation occurrences, into
/// PMI leaves of the visualisation data of the parts they belong to.
///
/// Open CASCADE 7.6 reads the semantic PMI into XCAF but gives it no presentation: the
/// annotations are read here from the file's entities. Each one becomes one PMI node:
/// - its type by what it shows, the dimension, tolerance, datum feature or datum target that
///   a draughting model item association ties to it or to the callout that holds it;
/// - its polylines as edges and its filled glyphs as the glyphs of one text, placed by the
///   annotation's own placement into the part's coordinates;
/// - links to the faces that the object it shows and its own shape aspects point at.
/// It goes into the part of those faces. What cannot be placed or linked goes to the notes.
///
/// Points at the work session, the unbound items, the parts, the model, the counts and the notes;
/// all must outlive it. Reads the session once, in Read().
class StepAnnotationReader {
public:
    /// Where the PMI node of one annotation went.
    struct Placed {
        unsigned int referenceId = 0;
        VizPort::WString visualId;
    };

    StepAnnotationReader(Handle(XSControl_WorkSession) const& session, StepUnboundItems& unbound,
                         std::vector<StepPart> const& parts, TarvexModel& model, StepCounts& counts,
                         std::vector<std::string>& notes);

    void Read();

    /// The PMI node made for annotation occurrence `occurrence`, or null.
    Placed const* Find(Handle(Standard_Transient) const& occurrence) const;

private:
    /// A face of a part: the part's index in the parts and the face's entity id.
    using FaceOfPart = std::pair<std::size_t, int>;

    void readOccurrence(Handle(Standard_Transient) const& occurrence);
    /// The faces, each once, that the objects an annotation shows point at through the shape
    /// aspects they name; counts the faces that no part holds in `unresolved`, and in
    /// `others` what they point at that is no face.
    void collectFaces(std::vector<Handle(Standard_Transient)> const& definitions,
                      std::vector<FaceOfPart>& faces, int& unresolved, int& others) const;
    void collectAspectItems(Handle(Standard_Transient) const& aspect,
                            std::vector<Handle(Standard_Transient)>& items,
                            std::vector<Handle(Standard_Transient)>& seen) const;
    std::string describe(Handle(Standard_Transient) const& occurrence) const;

    Handle(XSControl_WorkSession) m_session;
    StepUnboundItems& m_unbound;          ///< not owned
    std::vector<StepPart> const& m_parts; ///< not owned
    TarvexModel& m_model;                 ///< not owned
    StepCounts& m_counts;                 ///< not owned
    std::vector<std::string>& m_notes;    ///< not owned
    /// Every face of every part by its topology, whatever its place and orientation. The keys
    /// point into the parts' shapes, which outlive the reader.
    std::unordered_map<TopoDS_TShape const*, FaceOfPart> m_faces;
    /// By annotation occurrence; the keys point at entities of the session's model, which
    /// outlives the reader.
    std::map<Standard_Transient const*, Placed> m_placed;
    double m_lengthFactor = 1;
};

} // namespace VizBridgeStep
