#include "loaders/VizWireLoader.h"

#include "contracts/kolba/VizEdge.h"
#include "contracts/kolba/VizWire.h"
#include "contracts/tarvex/TarvexVisuEdgeIter.h"
#include "contracts/tarvex/TarvexWString.h"
#include "loaders/LoadAs.h"
#include "loaders/VizEdgeLoader.h"

namespace VizBridgeTarvex {

using KolbaVizCore::VizEdge;
using KolbaVizCore::VizWire;

VizWireLoader::VizWireLoader(TarvexVisuWire const& source,
                             std::vector<TarvexVisuAttributes>* attributes,
                             bool const& inheritAttributes)
    : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

KolbaVizCore::VizElement* VizWireLoader::loadOne() {
    auto* const wire = dynamic_cast<VizWire*>(makeOne());
    if (wire == nullptr)
        return nullptr;

    TarvexWString id;
    if (m_source->GetID(id))
        wire->SetVisualID(id.ToWString());

    TarvexVisuEdgeIter edges = m_source->GetEdgeIterator();
    int const count = edges.GetCount();
    wire->SetEdgeCountHint(count > 0 ? static_cast<unsigned int>(count) : 0u);
    while (edges.Next()) {
        TarvexVisuEdge const source = edges.Current();
        // The wire carries no colour of its own here, so its edges always look up the stack.
        VizEdgeLoader loader(source, m_attributes, true);
        wire->AddEdge(loadAs<VizEdge>(loader).release());
    }
    return wire;
}

} // namespace VizBridgeTarvex
