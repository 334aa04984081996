#pragma once

#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/kolba/VizBox.h>
#include <VizBridge/modelerkit/BrepPartRenderer.h>

#include <cstdint>

namespace KolbaVizCore {
class SceneBuilder;
} // namespace KolbaVizCore

namespace VizBridgeStep {

class OcctPartContainer;

/// Draws one OcctPartContainer in the levels of a BrepPartRenderer, the same as the
/// reference modeler's, so that the product renderer reads a picked path of either the same
/// way.
///
/// Faces and edges carry the part's numbering (StepPart): face i has the id i, edge i the id
/// StepPart::kEdgeIdBase + i; degenerated edges are left out. The triangles are those that
/// BRepMesh left on the faces when the document was read; a face without any is meshed again
/// on a copy, with the container's deflections, so that the shared document stays as it was
/// read. A face takes the colour the file gives it, else the part's colour, else none, so
/// that the instance's colour and the viewer's defaults apply; edges take none.
///
/// Points at the container and at the builder (through ARenderer), owning neither: the
/// product structure keeps the container alive, the host the builder. Owns nothing else but
/// the path it was created at. A copy shares the drawing.
class OcctBrepRenderer : public VizModelerKit::BrepPartRenderer {
public:
    /// `current` is the path of the node to draw below, as the caller saw it when it made
    /// the renderer; empty: whatever node is current at Render.
    OcctBrepRenderer(OcctPartContainer const& container, KolbaVizCore::SceneBuilder& builder,
                     KolbaVizCore::RenderId current);
    ~OcctBrepRenderer() override;

private:
    /// The reference id.
    std::uint32_t bodyTag() const override;
    bool hasEntity(std::uint32_t type, std::uint32_t id) const override;
    void drawFaces(KolbaVizCore::SceneBuilder& builder) const override;
    void drawEdges(KolbaVizCore::SceneBuilder& builder) const override;
    /// From the part's exact geometry; empty for a part without a shape.
    KolbaVizCore::VizBox partBox() const override;

    OcctPartContainer const* m_container; ///< not owned
};

} // namespace VizBridgeStep
