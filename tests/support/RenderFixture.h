#pragma once

// A scene to render into, hand-made elements and a window onto TarvexRenderer's records,
// for the renderer tests.

#include <VizBridge/contracts/kolba/DefaultGeometryItemFactory.h>
#include <VizBridge/contracts/kolba/RecordingView3D.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/View3DAdapter.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/render/TarvexRenderer.h>

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <string>
#include <vector>

namespace VizBridgeTarvex {

/// A SceneBuilder with the default item factory and a view that records its extents.
/// One call of the render's progress callback. The callback is a plain function pointer, so
/// the calls go to one process-wide list that each test clears before it renders.
struct Progress {
    int done;
    int total;
    std::string phase;
};
inline std::vector<Progress>& progress() {
    static std::vector<Progress> calls;
    return calls;
}
inline void recordProgress(int const& done, int const& total, char const* phase) {
    progress().push_back({done, total, phase});
}

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

/// TarvexRenderer with its constructor and records in reach of the tests.
class TarvexRendererProbe : public TarvexRenderer {
public:
    TarvexRendererProbe(VizProductStructure* structure, KolbaVizCore::SceneBuilder* builder,
                        VizModelerServices* services, double x = 0, double y = 0, double z = 0)
        : TarvexRenderer(structure, builder, services, x, y, z) {}

    using TarvexRenderer::brepRenderMap;
    using TarvexRenderer::geometryRenderMap;
    using TarvexRenderer::hasMultipleRoots;
    using TarvexRenderer::linkMap;
    using TarvexRenderer::preRender;

    std::size_t brepRendererCount() { return brepRenderers().size(); }
};

} // namespace VizBridgeTarvex
