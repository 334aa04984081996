#pragma once

#include <VizBridge/contracts/kolba/GeometryItem.h>

#include <array>
#include <vector>

namespace KolbaVizCore {

/// Triangles: vertex and normal coordinates (three floats a point), indices that count
/// points, and the mode that says how the indices make triangles (the values of
/// TriangleType: 1 list, 2 strip, 3 fan). Owns copies of its arrays.
class PolygonItem : public GeometryItem {
public:
    /// The factory has checked the data: counts of floats a multiple of 3, every index a
    /// point of `vertices`, a mode from 1 to 3.
    PolygonItem(unsigned long tag, std::vector<float> vertices, std::vector<float> normals,
                std::vector<int> indices, int mode);

    std::vector<float> const& GetVertices() const { return m_vertices; }
    std::vector<float> const& GetNormals() const { return m_normals; }
    std::vector<int> const& GetIndices() const { return m_indices; }
    int GetMode() const { return m_mode; }

    /// The triangles the indices make, as triples of point numbers.
    std::vector<std::array<int, 3>> GetTriangles() const;

    void AddToBox(Matrix4 const& world, VizBox& box) const override;

protected:
    std::string describeData() const override;
    /// The nearest triangle the ray pierces, from either side; a surface needs no tolerance.
    bool intersectRay(Ray const& ray, Matrix4 const& world, double tolerance,
                      double& t) const override;

private:
    std::vector<float> m_vertices;
    std::vector<float> m_normals;
    std::vector<int> m_indices;
    int m_mode;
};

} // namespace KolbaVizCore
