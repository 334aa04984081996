#pragma once

// A small product scene shared by the scene builder tests: "ROOT" / product 77 / two
// instances of one part, the second showing the first's "Part" node through a reference.

#include <VizBridge/contracts/kolba/BodyContext.h>
#include <VizBridge/contracts/kolba/ContainerContext.h>
#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/contracts/kolba/EntityTypeContext.h>
#include <VizBridge/contracts/kolba/SceneBuilder.h>
#include <VizBridge/contracts/kolba/SceneContext.h>
#include <VizBridge/contracts/kolba/SceneLevelContext.h>
#include <VizBridge/contracts/kolba/VizTransf.h>

#include <cstdint>
#include <initializer_list>

namespace SceneTest {

using namespace KolbaVizCore;

constexpr std::uint32_t ProductTag = 77;

inline RenderId pathOf(std::initializer_list<std::uint32_t> tags) {
    RenderId id(1);
    for (std::uint32_t const tag : tags)
        id.AddValue(tag);
    return id;
}

inline void placeAt(SceneBuilder& builder, double x, double y, double z) {
    double const translation[3] = {x, y, z};
    double matrix[16];
    VizTransf(nullptr, translation).AsArray(matrix);
    builder.SetCurrentTransform(matrix);
}

/// The triangle (0,0,z) (1,0,z) (0,1,z), as a renderer adds it.
inline void addTriangle(SceneBuilder& builder, unsigned long tag, float z) {
    float const vertices[9] = {0, 0, z, 1, 0, z, 0, 1, z};
    int const indices[3] = {0, 1, 2};
    builder.AddGeometryItem(
        builder.GetGeometryItemFactory()->MakePolygon(tag, vertices, nullptr, indices, 9, 0, 3, 1));
}

/// P.1 (tag 1000) at x = 10 draws Part/Geometry/Mesh12 with one triangle; P.2 (tag 1001) at
/// x = 20 references P.1's Part node, as a second instance of a part does.
inline void buildTwoInstances(SceneBuilder& builder) {
    SceneContext scene(&builder, Node::RootNodeId, u"ROOT");
    ContainerContext product(&builder, ProductTag, u"Plate", 1);
    {
        SceneLevelContext first(&builder, 1000, u"P.1");
        placeAt(builder, 10, 0, 0);
        SceneLevelContext part(&builder, Group, u"Part");
        EntityTypeContext geometry(&builder, Vis, u"Geometry");
        BodyContext body(&builder, 12, u"Mesh12");
        addTriangle(builder, 0, 0.0f);
    }
    SceneLevelContext second(&builder, 1001, u"P.2");
    placeAt(builder, 20, 0, 0);
    builder.AddNodeReference(pathOf({Node::RootNodeId, ProductTag, 1000, Group}));
}

} // namespace SceneTest
