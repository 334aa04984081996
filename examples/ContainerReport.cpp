#include "ContainerReport.h"

#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizContainer.h>
#include <VizBridge/contracts/kolba/VizEdge.h>
#include <VizBridge/contracts/kolba/VizFace.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizPoints.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>
#include <VizBridge/contracts/kolba/VizText.h>
#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/contracts/kolba/VizWire.h>
#include <VizBridge/contracts/platform/WString.h>

#include <cstddef>
#include <string>
#include <vector>

namespace VizBridgeExamples {

using namespace KolbaVizCore;
using VizPort::Narrow;

namespace {

/// "1 mesh", "2 meshes": the count and the noun in the form the count asks for.
std::string Count(std::size_t count, char const* one, char const* many) {
    return std::to_string(count) + ' ' + (count == 1 ? one : many);
}

/// The element's own colour, its hidden state, and nothing when it has neither.
std::string State(VizElement const& element) {
    std::string state;
    if (element.HasColor()) {
        RGBAColor const c = element.GetColor();
        state += ", colour " + std::to_string(c.red) + ',' + std::to_string(c.green) + ',' +
                 std::to_string(c.blue) + ',' + std::to_string(c.alpha);
    }
    if (element.GetHidden())
        state += ", hidden";
    return state;
}

std::size_t TriangleCount(std::vector<VizFace*> const& faces) {
    std::size_t count = 0;
    for (VizFace const* face : faces)
        for (VizPolygon const* polygon : face->GetPolygons())
            count += polygon->GetIndices().size() / 3;
    return count;
}

std::string Joined(std::vector<VizPort::WString> const& texts) {
    std::string joined;
    for (VizPort::WString const& text : texts)
        joined += (joined.empty() ? "" : ", ") + Narrow(text);
    return joined;
}

void PrintMeshes(std::ostream& out, char const* list, std::vector<VizMesh*> const& meshes) {
    for (VizMesh const* mesh : meshes)
        out << "    " << list << ' ' << Narrow(mesh->GetVisualID()) << ": "
            << Count(mesh->GetFaces().size(), "face", "faces") << " ("
            << Count(TriangleCount(mesh->GetFaces()), "triangle", "triangles") << "), "
            << Count(mesh->GetEdges().size(), "edge", "edges") << State(*mesh) << '\n';
}

void PrintWires(std::ostream& out, char const* list, std::vector<VizWire*> const& wires) {
    for (VizWire const* wire : wires)
        out << "    " << list << ' ' << Narrow(wire->GetVisualID()) << ": "
            << Count(wire->GetEdges().size(), "edge", "edges") << State(*wire) << '\n';
}

void PrintPointSets(std::ostream& out, char const* list, std::vector<VizPointSet*> const& sets) {
    for (VizPointSet const* set : sets) {
        out << "    " << list << State(*set) << ':';
        for (VizPoints const* group : set->GetPointSets())
            out << ' ' << Count(group->GetVertices().size() / 3, "point", "points")
                << State(*group);
        out << '\n';
    }
}

void PrintPMI(std::ostream& out, VizPMI const& pmi) {
    out << "    " << Narrow(pmi.ToString()) << " [" << pmi.GetGroupType().GetName() << '/'
        << pmi.GetType().GetName() << "]: " << Count(pmi.GetEdges().size(), "edge", "edges") << ", "
        << Count(pmi.GetFaces().size(), "face", "faces") << ", "
        << Count(pmi.GetTexts().size(), "text", "texts") << State(pmi) << '\n';
    for (VizText const* text : pmi.GetTexts())
        out << "      text \"" << Narrow(text->GetText()) << "\" in " << Narrow(text->GetFontName())
            << ", height " << text->GetFontSize() << State(*text) << '\n';
    std::vector<VizPort::WString> const& ids = pmi.GetLinkedEntityIDs();
    std::vector<VizPort::WString> const& mechanicalIds = pmi.GetLinkedEntityMechIDs();
    for (std::size_t i = 0; i < ids.size(); ++i)
        out << "      points at " << Narrow(ids[i]) << " -> "
            << (i < mechanicalIds.size() && !mechanicalIds[i].empty() ? Narrow(mechanicalIds[i])
                                                                      : "(unresolved)")
            << '\n';
}

char const* CameraName(VizCapture::CameraType type) {
    switch (type) {
    case VizCapture::PerspectiveCamera:
        return "perspective camera";
    case VizCapture::OrthographicCamera:
        return "orthographic camera";
    default:
        return "no camera type";
    }
}

} // namespace

void PrintVizContainer(std::ostream& out, VizContainer const& container) {
    out << "  VizContainer (scale " << container.GetScaleFactor()
        << "): " << Count(container.GetMeshes().size(), "mesh", "meshes") << ", "
        << Count(container.GetWires().size(), "wire", "wires") << ", "
        << Count(container.GetPointSets().size(), "point set", "point sets")
        << "; constructed: " << Count(container.GetCGMeshes().size(), "mesh", "meshes") << ", "
        << Count(container.GetCGWires().size(), "wire", "wires") << ", "
        << Count(container.GetCGPointSets().size(), "point set", "point sets") << '\n';
    PrintMeshes(out, "mesh", container.GetMeshes());
    PrintMeshes(out, "constructed mesh", container.GetCGMeshes());
    PrintWires(out, "wire", container.GetWires());
    PrintWires(out, "constructed wire", container.GetCGWires());
    PrintPointSets(out, "point set", container.GetPointSets());
    PrintPointSets(out, "constructed point set", container.GetCGPointSets());
}

void PrintVizPMIContainer(std::ostream& out, VizPMIContainer const& container) {
    out << "  VizPMIContainer: " << Count(container.GetVizPMIs().size(), "PMI", "PMI") << ", "
        << Count(container.GetViews().size(), "view", "views") << ", "
        << Count(container.GetCaptures().size(), "capture", "captures") << "; constructed for PMI: "
        << Count(container.GetVizFTACGMeshes().size(), "mesh", "meshes") << ", "
        << Count(container.GetVizFTACGWires().size(), "wire", "wires") << ", "
        << Count(container.GetVizFTACGPointSets().size(), "point set", "point sets") << '\n';
    for (VizPMI const* pmi : container.GetVizPMIs())
        PrintPMI(out, *pmi);
    for (VizView const* view : container.GetViews())
        out << "    " << Narrow(view->GetViewAsString()) << ": "
            << (view->HasPlane() ? "in a plane" : "no plane") << ", shows "
            << Joined(view->GetMembers()) << State(*view) << '\n';
    for (VizCapture const* capture : container.GetCaptures())
        out << "    " << Narrow(capture->GetCaptureAsString()) << ": "
            << CameraName(capture->GetCameraType()) << (capture->GetActive() ? ", active" : "")
            << ", shows " << Joined(capture->GetMembers()) << State(*capture) << '\n';
}

} // namespace VizBridgeExamples
