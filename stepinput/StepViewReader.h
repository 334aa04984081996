#pragma once

#include <VizBridge/stepinput/StepAnnotationReader.h>
#include <VizBridge/stepinput/StepDocument.h>

#include <Standard_Transient.hxx>
#include <XSControl_WorkSession.hxx>

#include <string>
#include <vector>

namespace VizBridgeStep {

/// Turns the saved views of a STEP AP242 file, its CAMERA_MODEL_D3 entities, into captures
/// of the visualisation data: the camera, read from the file (Open CASCADE 7.6 gives the
/// view's position as the origin), and the PMI that the view shows: the annotations that the
/// draughting model holding the camera holds, directly, in callouts and annotation planes or
/// through mapped representations.
///
/// A view goes to the part of the annotations it shows, or to the one part of a file that has
/// one. Points at the work session, the annotations, the parts, the model, the counts and the
/// notes; all must outlive it. Read() reads the views once, after the annotations were read.
class StepViewReader {
public:
    StepViewReader(Handle(XSControl_WorkSession) const& session,
                   StepAnnotationReader const& annotations, std::vector<StepPart> const& parts,
                   TarvexModel& model, StepCounts& counts, std::vector<std::string>& notes);

    void Read();

private:
    void readView(Handle(Standard_Transient) const& camera, int number);
    /// Adds the PMI of the annotations that `item` holds to `shown`, each once.
    void collectShown(Handle(Standard_Transient) const& item,
                      std::vector<StepAnnotationReader::Placed>& shown,
                      std::vector<Handle(Standard_Transient)>& seen) const;

    Handle(XSControl_WorkSession) m_session;
    StepAnnotationReader const& m_annotations; ///< not owned
    std::vector<StepPart> const& m_parts;      ///< not owned
    TarvexModel& m_model;                      ///< not owned
    StepCounts& m_counts;                      ///< not owned
    std::vector<std::string>& m_notes;         ///< not owned
};

} // namespace VizBridgeStep
