#include <VizBridge/contracts/kolba/VizMesh.h>

namespace KolbaVizCore {

namespace {

void enter(std::map<VizPort::WString, VizElement*>& map, VizElement* element) {
    VizPort::WString const id = element->GetVisualID();
    if (!id.empty())
        map[id] = element;
}

} // namespace

void VizMesh::FillVisuIdMap(std::map<VizPort::WString, VizElement*>& map) {
    enter(map, this);
    for (VizFace* face : m_faces.Get())
        enter(map, face);
    for (VizEdge* edge : m_edges.Get())
        enter(map, edge);
}

} // namespace KolbaVizCore
