#include <VizBridge/contracts/kolba/PolygonItem.h>

#include <VizBridge/contracts/kolba/Matrix4.h>
#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/TriangleType.h>
#include <VizBridge/contracts/kolba/VizBox.h>

#include <cmath>
#include <sstream>
#include <utility>

namespace KolbaVizCore {

namespace {

void subtract(double const* a, double const* b, double* out) {
    for (int axis = 0; axis < 3; ++axis)
        out[axis] = a[axis] - b[axis];
}

void cross(double const* a, double const* b, double* out) {
    out[0] = a[1] * b[2] - a[2] * b[1];
    out[1] = a[2] * b[0] - a[0] * b[2];
    out[2] = a[0] * b[1] - a[1] * b[0];
}

double dot(double const* a, double const* b) {
    return a[0] * b[0] + a[1] * b[1] + a[2] * b[2];
}

/// Möller–Trumbore, two-sided: a triangle is hit from either side.
bool intersectTriangle(Ray const& ray, double const* p0, double const* p1, double const* p2,
                       double& t) {
    double edge1[3];
    double edge2[3];
    subtract(p1, p0, edge1);
    subtract(p2, p0, edge2);
    double pvec[3];
    cross(ray.direction, edge2, pvec);
    double const determinant = dot(edge1, pvec);
    // Relative to the sizes involved, so that tiny and huge models are treated alike.
    double const scale =
        std::sqrt(dot(edge1, edge1) * dot(edge2, edge2) * dot(ray.direction, ray.direction));
    if (scale == 0.0 || std::fabs(determinant) <= 1e-12 * scale)
        return false; // degenerate triangle, or a ray in its plane
    double const inverse = 1.0 / determinant;
    double tvec[3];
    subtract(ray.origin, p0, tvec);
    double const u = dot(tvec, pvec) * inverse;
    if (u < 0.0 || u > 1.0)
        return false;
    double qvec[3];
    cross(tvec, edge1, qvec);
    double const v = dot(ray.direction, qvec) * inverse;
    if (v < 0.0 || u + v > 1.0)
        return false;
    double const hit = dot(edge2, qvec) * inverse;
    if (hit <= 0.0)
        return false;
    t = hit;
    return true;
}

} // namespace

PolygonItem::PolygonItem(unsigned long tag, std::vector<float> vertices, std::vector<float> normals,
                         std::vector<int> indices, int mode)
    : GeometryItem(Type::Polygon, tag), m_vertices(std::move(vertices)),
      m_normals(std::move(normals)), m_indices(std::move(indices)), m_mode(mode) {}

std::vector<std::array<int, 3>> PolygonItem::GetTriangles() const {
    std::vector<std::array<int, 3>> triangles;
    std::size_t const count = m_indices.size();
    if (count < 3)
        return triangles;
    switch (m_mode) {
    case TriangleStrip:
        for (std::size_t i = 0; i + 2 < count; ++i)
            triangles.push_back({m_indices[i], m_indices[i + 1], m_indices[i + 2]});
        break;
    case TriangleFan:
        for (std::size_t i = 1; i + 1 < count; ++i)
            triangles.push_back({m_indices[0], m_indices[i], m_indices[i + 1]});
        break;
    default:
        // A list: indices beyond the last full triple make no triangle.
        for (std::size_t i = 0; i + 2 < count; i += 3)
            triangles.push_back({m_indices[i], m_indices[i + 1], m_indices[i + 2]});
        break;
    }
    return triangles;
}

bool PolygonItem::intersectRay(Ray const& ray, Matrix4 const& world, double /*tolerance*/,
                               double& t) const {
    bool found = false;
    double nearest = 0.0;
    for (std::array<int, 3> const& triangle : GetTriangles()) {
        double corners[3][3];
        for (int corner = 0; corner < 3; ++corner) {
            float const* point = m_vertices.data() + static_cast<std::size_t>(triangle[corner]) * 3;
            double const local[3] = {point[0], point[1], point[2]};
            world.ApplyToPoint(local, corners[corner]);
        }
        double hit = 0.0;
        if (intersectTriangle(ray, corners[0], corners[1], corners[2], hit) &&
            (!found || hit < nearest)) {
            nearest = hit;
            found = true;
        }
    }
    if (found)
        t = nearest;
    return found;
}

void PolygonItem::AddToBox(Matrix4 const& world, VizBox& box) const {
    addPointsToBox(m_vertices, world, box);
}

std::string PolygonItem::describeData() const {
    std::ostringstream text;
    text << "mode=" << m_mode << " n=" << m_indices.size();
    return text.str();
}

} // namespace KolbaVizCore
