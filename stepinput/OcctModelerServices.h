#pragma once

#include <VizBridge/modelerkit/BrepModelerServices.h>
#include <VizBridge/stepinput/StepReadOptions.h>

#include <memory>

namespace VizBridgeStep {

class StepDocument;

/// The modeler for the BREP of STEP files: it imports a part as the Open CASCADE shape that
/// a StepDocument read (an OcctPartContainer), draws it with an OcctBrepRenderer, and names
/// faces and edges by the part's numbering (StepPart), the same ids that the tessellated
/// road gives them; the rest of the modeler is the BrepModelerServices it derives from.
///
/// Shares the document with its clones and containers, so that it outlives all of them;
/// owns nothing else but the deflections.
class OcctModelerServices : public VizModelerKit::BrepModelerServices {
public:
    /// `document` is shared with every clone and container; with a null one every ImportPart
    /// fails. `options` are the ones the document was read with: a face that the reading left
    /// without triangles is meshed again with their deflections.
    explicit OcctModelerServices(std::shared_ptr<StepDocument const> document,
                                 StepReadOptions const& options = {});

    /// "Open CASCADE".
    VizBridgeTarvex::WString GetName() override;
    /// A copy on the same document; the caller owns it.
    VizModelerServices* Clone() override;
    /// Hands out a new OcctPartContainer on the document's part of reference `id`, and the
    /// part document's PMI in `result`. `policy` is not read: the shape was read with the
    /// document. Fails with a text that names the reference when the document has no such
    /// part.
    bool ImportPart(int const& id, TarvexPartDocument& document, TarvexPartImportResult& result,
                    VizBridgeTarvex::VizPartContainer*& container, TarvexPolicy* policy,
                    VizBridgeTarvex::WString& error) override;

private:
    /// Whether `container` is an OcctPartContainer.
    bool ownsPart(VizBridgeTarvex::VizPartContainer const& container) const override;
    bool hasEntity(VizBridgeTarvex::VizPartContainer const& part, KolbaVizCore::EntityType type,
                   unsigned long id) const override;
    /// An OcctBrepRenderer.
    std::unique_ptr<VizModelerKit::BrepPartRenderer>
    newRenderer(VizBridgeTarvex::VizPartContainer const& part, KolbaVizCore::SceneBuilder& builder,
                VizBridgeTarvex::RenderId current) const override;

    std::shared_ptr<StepDocument const> m_document;
    StepReadOptions m_options;
};

} // namespace VizBridgeStep
