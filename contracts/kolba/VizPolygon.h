#pragma once

#include <VizBridge/contracts/kolba/TriangleType.h>
#include <VizBridge/contracts/kolba/VizElement.h>

#include <string>
#include <vector>

namespace KolbaVizCore {

/// The triangles of one face: indices into the face's coordinate arrays, and how they make
/// triangles. An index counts floats, not points (0, 3, 6 … name the first, second, third
/// point), as the import data gives them; the renderer resolves them.
class VizPolygon : public VizElement {
public:
    static std::string TypeID() { return "VizPolygon"; }
    std::string const GetElementType() const override { return TypeID(); }

    /// Keeps a copy of `count` indices; a null array leaves no indices.
    void SetIndices(unsigned int count, int const* indices);
    std::vector<int> const& GetIndices() const { return m_indices; }

    void SetPolygonType(TriangleType type) { m_type = type; }
    TriangleType GetPolygonType() const { return m_type; }

private:
    std::vector<int> m_indices;
    TriangleType m_type = UndefinedTriangles;
};

} // namespace KolbaVizCore
