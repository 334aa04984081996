#include "SampleBox.h"

#include <string>

namespace VizBridgeExamples {

namespace {

// Each face by its four corners, counter-clockwise seen from outside, and its outer normal.
constexpr unsigned int kFaces[6][4] = {{0, 3, 2, 1}, {4, 5, 6, 7}, {0, 1, 5, 4},
                                       {2, 3, 7, 6}, {1, 2, 6, 5}, {0, 4, 7, 3}};
constexpr float kNormals[6][3] = {{0, 0, -1}, {0, 0, 1}, {0, -1, 0},
                                  {0, 1, 0},  {1, 0, 0}, {-1, 0, 0}};
constexpr unsigned int kEdges[12][2] = {{0, 1}, {1, 2}, {2, 3}, {3, 0}, {4, 5}, {5, 6},
                                        {6, 7}, {7, 4}, {0, 4}, {1, 5}, {2, 6}, {3, 7}};
constexpr unsigned int kFaceCount = 6;

VizPort::WString Numbered(char const* prefix, unsigned int number) {
    return VizPort::Widen(prefix + std::to_string(number));
}

} // namespace

SampleBox::SampleBox(float sx, float sy, float sz)
    : m_corners{{{0, 0, 0},
                 {sx, 0, 0},
                 {sx, sy, 0},
                 {0, sy, 0},
                 {0, 0, sz},
                 {sx, 0, sz},
                 {sx, sy, sz},
                 {0, sy, sz}}} {}

TarvexAuthoredPartGeometry SampleBox::Brep(unsigned int firstId) const {
    TarvexAuthoredPartGeometry geometry;
    unsigned int id = firstId;
    for (auto const& face : kFaces) {
        TarvexAuthoredFace authored;
        authored.entityId = id++;
        for (unsigned int corner : face)
            authored.vertices.insert(authored.vertices.end(), m_corners[corner].begin(),
                                     m_corners[corner].end());
        authored.triangles = {0, 1, 2, 0, 2, 3};
        geometry.faces.push_back(std::move(authored));
    }
    for (auto const& edge : kEdges) {
        TarvexAuthoredEdge authored;
        authored.entityId = id++;
        for (unsigned int corner : edge)
            authored.points.insert(authored.points.end(), m_corners[corner].begin(),
                                   m_corners[corner].end());
        geometry.edges.push_back(std::move(authored));
    }
    return geometry;
}

TarvexAuthoredVisuMesh SampleBox::Mesh(VizPort::WString const& name, unsigned int firstId) const {
    TarvexAuthoredVisuMesh mesh;
    mesh.id = name + u".Body";
    mesh.mechanicalId = name;
    for (unsigned int f = 0; f < kFaceCount; ++f) {
        TarvexAuthoredVisuFace face;
        face.id = FaceId(name, static_cast<int>(f + 1));
        face.mechanicalId = Numbered("Face", firstId + f);
        for (unsigned int corner : kFaces[f]) {
            face.vertices.insert(face.vertices.end(), m_corners[corner].begin(),
                                 m_corners[corner].end());
            face.normals.insert(face.normals.end(), kNormals[f], kNormals[f] + 3);
        }
        // Indices are offsets into the float arrays: corner k starts at 3k.
        TarvexAuthoredVisuPolygon triangles;
        triangles.indices = std::vector<int>{0, 3, 6, 0, 6, 9};
        face.polygons.push_back(triangles);
        mesh.faces.push_back(std::move(face));
    }
    unsigned int k = 0;
    for (auto const& ends : kEdges) {
        TarvexAuthoredVisuEdge edge;
        edge.mechanicalId = Numbered("Edge", firstId + kFaceCount + k);
        ++k;
        for (unsigned int corner : ends)
            edge.points.insert(edge.points.end(), m_corners[corner].begin(),
                               m_corners[corner].end());
        edge.lineIndices = std::vector<int>{0, 3};
        mesh.edges.push_back(std::move(edge));
    }
    return mesh;
}

VizPort::WString SampleBox::FaceId(VizPort::WString const& name, int k) {
    return name + VizPort::Widen(".F" + std::to_string(k));
}

} // namespace VizBridgeExamples
