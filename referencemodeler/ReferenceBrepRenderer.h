#pragma once

#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/kolba/VizBox.h>
#include <VizBridge/modelerkit/BrepPartRenderer.h>

#include <cstdint>

namespace KolbaVizCore {
class SceneBuilder;
} // namespace KolbaVizCore

namespace VizReferenceModeler {

class ReferencePartContainer;

/// Draws one ReferencePartContainer in the levels of a BrepPartRenderer: each face as one
/// triangle list, each edge as one polyline, named by their authored entity ids. The part
/// has no colours: faces and edges take none of their own, so that an instance's colour and
/// the viewer's defaults apply.
///
/// Points at the container and at the builder (through ARenderer), owning neither: the
/// product structure keeps the container alive, the host the builder. Owns nothing else but
/// the path it was created at. A copy shares the drawing.
class ReferenceBrepRenderer : public VizModelerKit::BrepPartRenderer {
public:
    /// `current` is the path of the node to draw below, as the caller saw it when it made
    /// the renderer; empty: whatever node is current at Render.
    ReferenceBrepRenderer(ReferencePartContainer const& container,
                          KolbaVizCore::SceneBuilder& builder, KolbaVizCore::RenderId current);
    ~ReferenceBrepRenderer() override;

private:
    /// The reference id.
    std::uint32_t bodyTag() const override;
    bool hasEntity(std::uint32_t type, std::uint32_t id) const override;
    void drawFaces(KolbaVizCore::SceneBuilder& builder) const override;
    void drawEdges(KolbaVizCore::SceneBuilder& builder) const override;
    /// Empty for a part without points.
    KolbaVizCore::VizBox partBox() const override;

    ReferencePartContainer const* m_container; ///< not owned
};

} // namespace VizReferenceModeler
