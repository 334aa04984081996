#pragma once

#include <VizBridge/contracts/kolba/VizElement.h>

#include <string>
#include <vector>

namespace KolbaVizCore {

/// A group of points, as a flat list of floats, three a point.
class VizPoints : public VizElement {
public:
    static std::string TypeID() { return "VizPoints"; }
    std::string const GetElementType() const override { return TypeID(); }

    void SetVertices(std::vector<float> const& vertices) { m_vertices = vertices; }
    std::vector<float> const& GetVertices() const { return m_vertices; }

private:
    std::vector<float> m_vertices;
};

} // namespace KolbaVizCore
