#pragma once

#include <VizBridge/contracts/kolba/OwnedPointers.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizElement.h>

#include <string>
#include <vector>

namespace KolbaVizCore {

/// A set of edges drawn as one wire body. Owns its edges.
class VizWire : public VizElement {
public:
    VizWire() = default;
    VizWire(VizWire const&) = delete;
    VizWire& operator=(VizWire const&) = delete;

    static std::string TypeID() { return "VizWire"; }
    std::string const GetElementType() const override { return TypeID(); }

    void SetEdgeCountHint(unsigned int count) { m_edges.Reserve(count); }
    /// Takes over `edge`; null is ignored.
    void AddEdge(VizEdge* edge) { m_edges.Add(edge); }
    std::vector<VizEdge*> const& GetEdges() const { return m_edges.Get(); }

private:
    OwnedPointers<VizEdge> m_edges;
};

} // namespace KolbaVizCore
