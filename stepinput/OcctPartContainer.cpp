#include <VizBridge/stepinput/OcctPartContainer.h>

#include <VizBridge/stepinput/StepDocument.h>

#include <BRepBndLib.hxx>
#include <BRep_Tool.hxx>
#include <Bnd_Box.hxx>
#include <TopoDS.hxx>

#include <utility>

namespace VizBridgeStep {

namespace {

VizBridgeTarvex::VizBox boxOf(TopoDS_Shape const& shape) {
    if (shape.IsNull())
        return {};
    // From the surfaces and curves, not the triangles: the triangles' corners lie on the
    // faces, so the box holds the drawing too, and it does not change with the deflection.
    Bnd_Box box;
    BRepBndLib::AddOptimal(shape, box, false, false);
    if (box.IsVoid())
        return {};
    double low[3], high[3];
    box.Get(low[0], low[1], low[2], high[0], high[1], high[2]);
    return VizBridgeTarvex::VizBox(low, high);
}

} // namespace

OcctPartContainer::OcctPartContainer(VizPort::WString const& name, int const& refId,
                                     std::shared_ptr<StepDocument const> document,
                                     StepPart const& part, StepReadOptions const& options)
    : VizPartContainer(name, refId), m_document(std::move(document)), m_part(&part),
      m_options(options), m_box(boxOf(part.shape)) {}

void OcctPartContainer::ReleaseModelerData() {}

char const* OcctPartContainer::GetModelerTypeName() const {
    return "Open CASCADE";
}

bool OcctPartContainer::IsModelerDataValid() const {
    return !m_part->shape.IsNull();
}

bool OcctPartContainer::HasFace(unsigned long id) const {
    return id >= 1 && id <= static_cast<unsigned long>(m_part->faces.Extent());
}

bool OcctPartContainer::HasEdge(unsigned long id) const {
    if (id <= StepPart::kEdgeIdBase ||
        id - StepPart::kEdgeIdBase > static_cast<unsigned long>(m_part->edges.Extent()))
        return false;
    int const index = static_cast<int>(id - StepPart::kEdgeIdBase);
    return !BRep_Tool::Degenerated(TopoDS::Edge(m_part->edges(index)));
}

} // namespace VizBridgeStep
