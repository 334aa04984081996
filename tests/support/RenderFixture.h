#pragma once

// A scene to render into, hand-made elements, the product most walk tests draw, and
// TarvexRenderer's constructor in reach, for the renderer tests.

#include "support/BuildStructure.h"
#include "support/VizProductStructureTestPeer.h"
#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/RecordingView3D.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/View3DAdapter.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizPoints.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/render/TarvexRenderer.h>

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

namespace VizBridgeTarvex {

/// The calls of the render's progress callback, one "done/total phase" line each. The
/// callback is a plain function pointer, so the calls go to one process-wide text that each
/// test clears before it renders.
inline std::string& progressText() {
    static std::string text;
    return text;
}
inline void recordProgress(int const& done, int const& total, char const* phase) {
    progressText() += std::to_string(done) + '/' + std::to_string(total) + ' ' + phase + '\n';
}

/// A SceneBuilder with the default item factory and a view that records its extents.
struct RenderScene {
    RenderScene() : adapter(&view, &builder) {
        builder.SetView3DAdapter(&adapter);
        builder.SetGeometryItemFactory(
            std::make_unique<KolbaVizCore::DefaultGeometryItemFactory>());
    }
    KolbaVizCore::RecordingView3D view;
    KolbaVizCore::SceneBuilder builder;
    KolbaVizCore::View3DAdapter adapter;
};

inline RenderId pathOf(std::initializer_list<std::uint32_t> tags) {
    RenderId id(1);
    for (std::uint32_t const tag : tags)
        id.AddValue(tag);
    return id;
}

inline TarvexPlacement at(double x, double y = 0) {
    TarvexPlacement placement;
    placement.translation[0] = x;
    placement.translation[1] = y;
    return placement;
}

/// Low corner, then high corner, as "(x y z)-(x y z)"; "empty" for an empty box.
inline std::string boxText(float const (&box)[6]) {
    if (box[0] > box[3])
        return "empty";
    std::ostringstream out;
    out << '(' << box[0] << ' ' << box[1] << ' ' << box[2] << ")-(" << box[3] << ' ' << box[4]
        << ' ' << box[5] << ')';
    return out.str();
}
inline std::string boxText(VizBox const& box) {
    float corners[6];
    for (int axis = 0; axis < 3; ++axis) {
        corners[axis] = static_cast<float>(box.GetLow()[axis]);
        corners[axis + 3] = static_cast<float>(box.GetHigh()[axis]);
    }
    return boxText(corners);
}
inline std::string boxText(KolbaVizCore::ARenderer const& renderer) {
    float box[6];
    renderer.GetGeometryBox(box);
    return boxText(box);
}

/// A triangle face over (x,0,0) (x+1,0,0) (x,1,0), with one polygon of `type`.
inline KolbaVizCore::VizFace*
makeTriangleFace(float x, KolbaVizCore::TriangleType type = KolbaVizCore::Triangles) {
    auto face = std::make_unique<KolbaVizCore::VizFace>();
    float const vertices[9] = {x, 0, 0, x + 1, 0, 0, x, 1, 0};
    float const normals[9] = {0, 0, 1, 0, 0, 1, 0, 0, 1};
    face->SetVertices(9, vertices);
    face->SetNormals(9, normals);
    auto polygon = std::make_unique<KolbaVizCore::VizPolygon>();
    int const offsets[3] = {0, 3, 6}; // float offsets, not point numbers
    polygon->SetIndices(3, offsets);
    polygon->SetPolygonType(type);
    face->AddPolygon(polygon.release()); // the face takes the polygon over
    return face.release();
}

inline KolbaVizCore::VizEdge*
makeEdge(std::initializer_list<float> points,
         KolbaVizCore::VizEdge::EdgeType type = KolbaVizCore::VizEdge::Polyline) {
    auto edge = std::make_unique<KolbaVizCore::VizEdge>();
    edge->SetVertices(std::vector<float>(points));
    edge->SetLineType(type);
    return edge.release();
}

/// A mesh `id` of one triangle face at `x` and one edge along it.
inline KolbaVizCore::VizMesh* makeMesh(int id, float x) {
    auto mesh = std::make_unique<KolbaVizCore::VizMesh>();
    mesh->setID(static_cast<unsigned long>(id));
    mesh->AddFace(makeTriangleFace(x));
    mesh->AddEdge(makeEdge({x, 0, 0, x + 1, 0, 0}));
    return mesh.release();
}

/// A container (owned by the caller, usually handed to a structure) with one mesh.
inline VizContainer* makeMeshContainer(int refId, int meshId, float x) {
    auto container = std::make_unique<VizContainer>(refId);
    container->AddMesh(makeMesh(meshId, x));
    return container.release();
}

/// The product Plate: P.1 and P.2 of part P (10, mesh 12), Q.1 of part Q (20, mesh 14), at
/// x = 10, 20, 30; at the top, or inside one root assembly A (30).
inline std::unique_ptr<VizProductStructure> plate(bool insideAssembly = false) {
    TarvexModel model;
    model.SetProductName(u"Plate");
    model.AddPart(10, u"P");
    model.AddPart(20, u"Q");
    if (insideAssembly) {
        model.AddAssembly(30, u"A");
        model.AddRootInstance(30, u"A.1");
    }
    auto place = [&](unsigned int ref, char16_t const* name, double x) {
        (insideAssembly ? model.AddInstance(30, ref, name) : model.AddRootInstance(ref, name))
            .placement = at(x);
    };
    place(10, u"P.1", 10);
    place(10, u"P.2", 20);
    place(20, u"Q.1", 30);
    std::unique_ptr<VizProductStructure> structure = buildStructure(model);
    VizProductStructureTestPeer::addVizContainer(*structure, 10, makeMeshContainer(10, 12, 0));
    VizProductStructureTestPeer::addVizContainer(*structure, 20, makeMeshContainer(20, 14, 0));
    return structure;
}

/// The scene's dump with the product node's tag, which the structure's address makes, as {T}.
inline std::string dumpOf(KolbaVizCore::SceneBuilder const& builder,
                          TarvexRenderer const& renderer) {
    std::string text = builder.Dump();
    if (renderer.GetProductRenderId().Length() < 2)
        return text;
    std::string const tag = std::to_string(renderer.GetProductRenderId()[1]);
    for (std::size_t at = text.find(tag); at != std::string::npos; at = text.find(tag))
        text.replace(at, tag.size(), "{T}");
    return text;
}

/// TarvexRenderer with its constructor, preRender, modeler renderers and the element drawing of
/// its base in reach of the tests.
class TarvexRendererProbe : public TarvexRenderer {
public:
    TarvexRendererProbe(VizProductStructure* structure, KolbaVizCore::SceneBuilder* builder,
                        VizModelerServices* services, double x = 0, double y = 0, double z = 0)
        : TarvexRenderer(structure, builder, services, x, y, z) {}

    using TarvexRenderer::getNextTag;
    using TarvexRenderer::preRender;
    using TarvexRenderer::renderVizMesh;
    using TarvexRenderer::renderVizPointSet;
    using TarvexRenderer::renderVizText;
    using TarvexRenderer::renderVizWire;

    std::size_t brepRendererCount() { return brepRenderers().size(); }
    using TarvexRenderer::brepRenderers;
    using TarvexRenderer::pmiRenderers;
    using TarvexRenderer::pmiRenderMap;
};

} // namespace VizBridgeTarvex
