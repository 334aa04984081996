#pragma once

#include <VizBridge/contracts/kolba/ARenderer.h>
#include <VizBridge/model/VizTypes.h>

#include <memory>
#include <vector>

namespace KolbaVizCore {
class VizEdge;
class VizFace;
class VizMesh;
class VizPointSet;
class VizPoints;
class VizPolygon;
class VizText;
class VizWire;
} // namespace KolbaVizCore

namespace VizBridgeTarvex {

class VizModelerServices;

/// Base of the system's renderers: turns loaded elements (meshes, wires, point sets and
/// their faces, edges, polygons, points, texts) into geometry items on the current node of
/// the SceneBuilder, gathers their bounding box, and hands out item tags.
///
/// It opens only the contexts below an element; the derived renderer opens the ones above
/// and so decides where the elements land. Failures here are silent: an element that cannot
/// be drawn (no factory, no item, a context refused) is skipped and rendering goes on.
///
/// Owns its own clone of the modeler services (may be null). Points at the SceneBuilder
/// through ARenderer, without owning it.
class AVizRenderer : public KolbaVizCore::ARenderer {
public:
    ~AVizRenderer() override;

    void GetGeometryCenter(float* const center) const override;
    float GetGeometryRadius() const override;
    /// Low corner, then high corner; six floats.
    void GetGeometryBox(float* const box) const override;

protected:
    /// `services` stays the caller's: the renderer works on a Clone of it.
    AVizRenderer(KolbaVizCore::SceneBuilder* builder, VizModelerServices* services);
    /// Each copy gets a clone of the services of its own, so that both may be destroyed.
    AVizRenderer(AVizRenderer const& other);
    AVizRenderer& operator=(AVizRenderer const& other);

    /// Centre and radius (a quarter of the diagonal, as viewers of these scenes expect it)
    /// from the box; false, and both untouched, when the box is empty.
    bool updateExtentsFromBox();
    /// Forgets the box; centre, radius and the tag counter stay.
    void clearBase();
    /// Tags count from 0 in the order items are built and are never reused.
    unsigned long getNextTag();
    void makeNameFromTag(unsigned long const& tag, WString& out);
    /// The current node takes `t` as its placement.
    void applyTransform(VizTransf const& t);
    /// Adds `count` points (three floats each) to `box`.
    void expandBBox(unsigned int count, float const* points, VizBox& box);
    /// The element's own colour into `color` if it has one; otherwise `color` stays.
    bool getVizColor(VizElement const& element, RGBAColor& color);

    /// `alpha` above 0 replaces the alpha byte of the faces' colours (not the edges').
    void renderVizMesh(KolbaVizCore::VizMesh const& mesh, VizBox& box, int alpha);
    void renderVizWire(KolbaVizCore::VizWire const& wire, VizBox& box);
    void renderVizPointSet(KolbaVizCore::VizPointSet const& set, VizBox& box);
    void renderVizFace(KolbaVizCore::VizFace const& face, VizBox& box, RGBAColor const& color);
    void renderVizEdge(KolbaVizCore::VizEdge const& edge, VizBox& box, RGBAColor const& color);
    void renderVizPoints(KolbaVizCore::VizPoints const& points, VizBox& box,
                         RGBAColor const& color);
    /// A text adds nothing to `box`: it is placed at its anchor in its own plane.
    void renderVizText(KolbaVizCore::VizText const& text, VizBox& box);
    /// The polygon's indices are float offsets into `vertices` and `normals`.
    void renderVizPolygon(KolbaVizCore::VizPolygon const& polygon,
                          std::vector<float> const& vertices, std::vector<float> const& normals,
                          RGBAColor const& color);

    VizModelerServices* rendererServices() const { return m_rendererServices.get(); }

    VizBox m_geometryBox;
    float m_geometryCenter[3] = {0.0f, 0.0f, 0.0f};
    float m_geometryRadius = 0.0f;

private:
    std::unique_ptr<VizModelerServices> m_rendererServices; ///< a Clone of the caller's
    unsigned long m_nextTag = 0;
};

} // namespace VizBridgeTarvex
