#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>

#include <memory>

namespace VizBridgeExamples {

/// The Bracket's PMI objects, as a drawing of it would carry them: their ids are the
/// mechanical ids of the tessellated PMI that show them. The front view holds every
/// annotation; the inspection capture shows the length and the flatness, and manages the
/// Bracket's body.
///
///     PMI:Bracket.PMI1  length 60 +/-0.1 between the left and right faces
///     PMI:Bracket.PMI2  note "2X M6 THRU"
///     PMI:Bracket.PMI3  flatness 0.05 of the bottom face, hidden
///     PMI:Bracket.PMI4  diameter 6.4 +0.1/0 of the holes
///     PMI:Bracket.PMI5  position 2X dia 0.2 (M) | A | B | C, composite dia 0.05 (M) | A
///     PMI:Bracket.PMI6  roughness Ra 1.6, machining required
///     PMI:Bracket.DatumA/B/C  datums on the bottom, front and left faces; A from three
///                       point targets
struct SamplePMI {
    std::shared_ptr<TarvexAuthoredPMIAnnotationView> front;
    std::shared_ptr<TarvexAuthoredPMICapture> inspection;

    /// The Bracket's objects, linked to the faces of its BREP from `firstFaceId` on.
    static SamplePMI Bracket(unsigned int firstFaceId);
};

} // namespace VizBridgeExamples
