#pragma once

#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/platform/WString.h>

#include <string>
#include <vector>

namespace KolbaVizCore {

/// A line of a part, a PMI or a stroked text: its points as a flat list of floats, three a
/// point, and how they connect.
class VizEdge : public VizElement {
public:
    enum EdgeType {
        UndefinedLine = 0,
        Polyline = 1,       ///< the points in order
        ClosedPolyline = 2, ///< the points in order; the loader repeats the first at the end
        LineSegments = 3,   ///< separate segments, one per pair of points
    };

    static std::string TypeID() { return "VizEdge"; }
    std::string const GetElementType() const override { return TypeID(); }

    void SetMechanicalID(VizPort::WString const& id) { m_mechanicalId = id; }
    VizPort::WString GetMechanicalID() const { return m_mechanicalId; }

    void SetLineType(EdgeType type) { m_lineType = type; }
    EdgeType GetLineType() const { return m_lineType; }

    void SetVertices(std::vector<float> const& vertices) { m_vertices = vertices; }
    std::vector<float> const& GetVertices() const { return m_vertices; }

    /// Makes the colour opaque: its alpha byte becomes 255. Whether the edge has a colour
    /// of its own stays as it was.
    void RemoveTransparency();

private:
    VizPort::WString m_mechanicalId;
    EdgeType m_lineType = UndefinedLine;
    std::vector<float> m_vertices;
};

} // namespace KolbaVizCore
