#include <VizBridge/loaders/VizWireLoader.h>

#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>
#include <VizBridge/loaders/HandOver.h>
#include <VizBridge/loaders/LoadAs.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/loaders/VizEdgeLoader.h>

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;
using KolbaVizCore::VizWire;

VizWireLoader::VizWireLoader(TarvexVisuWire const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : VizSourceLoader(source, attributes, inheritAttributes) {}

KolbaVizCore::VizElement* VizWireLoader::loadOne() {
    auto* const wire = dynamic_cast<VizWire*>(makeOne());
    if (wire == nullptr)
        return nullptr;

    TarvexWString id;
    if (m_source->GetID(id))
        wire->SetVisualID(textOrEmpty(id));

    TarvexVisuEdgeIter edges = m_source->GetEdgeIterator();
    int const count = edges.GetCount();
    wire->SetEdgeCountHint(countHint(count));
    while (edges.Next()) {
        TarvexVisuEdge const source = edges.Current();
        // The wire carries no colour of its own here, so its edges always look up the stack.
        VizEdgeLoader loader(source, m_attributes, true);
        handOver(loadAs<VizEdge>(loader), [wire](VizEdge* const edge) { wire->AddEdge(edge); });
    }
    return wire;
}

} // namespace VizBridgeTarvex
