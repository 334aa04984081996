#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredPartGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>

#include <array>

namespace VizBridgeExamples {

/// A box of `sx` by `sy` by `sz` millimetres standing on the origin, told both ways a part
/// document can carry it: as the faces and edges of its BREP, and as the tessellated mesh of
/// its visualisation data. Both name their faces and edges by the same entity ids, so that
/// the mesh's mechanical ids point at the BREP's entities.
///
/// Faces in order: bottom (z = 0), top, front (y = 0), back, right (x = sx), left.
class SampleBox {
public:
    SampleBox(float sx, float sy, float sz);

    /// Six faces of two triangles (entity ids `firstId` to `firstId + 5`) and the twelve
    /// edges (the next twelve ids).
    TarvexAuthoredPartGeometry Brep(unsigned int firstId) const;

    /// The same six faces with a normal per vertex and the same twelve edges as lines. The
    /// mesh has the visual id `<name>.Body` and face k (from 1) `<name>.F<k>`; the mechanical
    /// ids of faces and edges are "Face<id>" and "Edge<id>" with the entity ids that
    /// Brep(firstId) gives them.
    TarvexAuthoredVisuMesh Mesh(VizPort::WString const& name, unsigned int firstId) const;

    /// The visual id that Mesh(name, …) gives face `k` (from 1).
    static VizPort::WString FaceId(VizPort::WString const& name, int k);

private:
    std::array<std::array<float, 3>, 8> m_corners;
};

} // namespace VizBridgeExamples
