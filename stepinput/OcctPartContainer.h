#pragma once

#include <VizBridge/model/VizPartContainer.h>
#include <VizBridge/stepinput/StepPart.h>
#include <VizBridge/stepinput/StepReadOptions.h>

#include <memory>

namespace VizBridgeStep {

class StepDocument;

/// The Open CASCADE modeler's BREP of one part: a StepPart of a StepDocument, with its faces
/// and edges named by the part's own numbering (StepPart), so that a face keeps the id that
/// the tessellated road gives it.
///
/// Shares the document (so the part stays alive as long as this container does, whatever
/// the modeler services that made it do) and owns only its box and the deflections the part
/// is meshed with.
class OcctPartContainer : public VizBridgeTarvex::VizPartContainer {
public:
    /// `part` is one of `document`'s parts, which the container keeps alive; with a null
    /// `document` the caller keeps `part` alive for as long as the container lives.
    /// `options` are the deflections the document was read with, for faces that must be
    /// meshed again.
    OcctPartContainer(VizPort::WString const& name, int const& refId,
                      std::shared_ptr<StepDocument const> document, StepPart const& part,
                      StepReadOptions const& options);

    /// Nothing to release: the document is shared and must keep answering for as long as
    /// the product structure holds this container.
    void ReleaseModelerData() override;
    /// "Open CASCADE": the container's type name reads "Open CASCADE BREP Container".
    char const* GetModelerTypeName() const override;
    /// True while the part has a shape.
    bool IsModelerDataValid() const override;

    /// Faces are 1 to the number of faces of the part.
    bool HasFace(unsigned long id) const;
    /// Edges are StepPart::kEdgeIdBase plus 1 to the number of edges; a degenerated edge
    /// (a point in space, such as the apex of a cone) has no curve to draw or pick and is
    /// none.
    bool HasEdge(unsigned long id) const;

    /// The part's bounding box from its exact geometry, in the part's own coordinates
    /// (millimetres); empty for a part without a shape.
    VizBridgeTarvex::VizBox GetBox() const { return m_box; }

    StepPart const& GetPart() const { return *m_part; }
    StepReadOptions const& GetOptions() const { return m_options; }

private:
    std::shared_ptr<StepDocument const> m_document; ///< keeps m_part alive
    StepPart const* m_part;                         ///< not owned: m_document's or the caller's
    StepReadOptions m_options;
    VizBridgeTarvex::VizBox m_box;
};

} // namespace VizBridgeStep
