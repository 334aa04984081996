#include "PmiViewing.h"

#include "ViewerQuestions.h"

#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIContainer.h>
#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/model/VizProductStructure.h>

#include <sstream>

namespace VizBridgeExamples {

using VizPort::Narrow;

namespace {

std::size_t indentOf(std::string const& line) {
    return line.find_first_not_of(' ');
}

bool opensPMISubtree(std::string const& line) {
    std::size_t const at = indentOf(line);
    return at != std::string::npos &&
           (line.compare(at, 11, "10005 type ") == 0 || line.compare(at, 11, "10010 type ") == 0 ||
            line.compare(at, 11, "10012 type ") == 0);
}

void printShown(std::ostream& out, char const* after,
                KolbaVizCore::VizPMIContainer const& container) {
    out << "  after " << after << ", shown:";
    for (KolbaVizCore::VizPMI const* pmi : container.GetVizPMIs())
        if (pmi && !pmi->GetHidden())
            out << " '" << Narrow(pmi->GetName()) << "'";
    out << '\n';
}

} // namespace

void PrintPMIScene(std::ostream& out, std::string const& dump) {
    std::istringstream lines(dump);
    std::string line;
    std::size_t subtree = std::string::npos; // the indent of the subtree being printed
    while (std::getline(lines, line)) {
        if (subtree != std::string::npos && indentOf(line) <= subtree)
            subtree = std::string::npos;
        if (subtree == std::string::npos && opensPMISubtree(line))
            subtree = indentOf(line);
        if (subtree != std::string::npos)
            out << line << '\n';
    }
}

void PrintPick(std::ostream& out, VizBridgeTarvex::VizProductStructure const& structure,
               KolbaVizCore::AView3DAdapter& view, char const* what, double const (&origin)[3],
               double const (&direction)[3]) {
    KolbaVizCore::Ray const ray = MakeRay(origin, direction);
    VizBridgeTarvex::VizElement* element = nullptr; // PickVisual wants both null
    VizBridgeTarvex::VizPSEntry* entry = nullptr;
    bool const found = structure.PickVisual(&view, ray, element, entry);
    out << "  ray " << what << ": " << (found ? "hit" : "nothing");
    if (element) {
        out << ", element " << element->GetElementType();
        if (auto const* pmi = dynamic_cast<KolbaVizCore::VizPMI const*>(element))
            out << " '" << Narrow(pmi->GetName()) << "'";
    }
    if (entry)
        out << ", instance '" << Narrow(entry->GetInstanceName()) << "'";
    out << '\n';
}

void ActivateAndPrint(std::ostream& out, VizBridgeTarvex::VizProductStructure& structure,
                      KolbaVizCore::VizPMIContainer const& container) {
    printShown(out, "the import", container);
    if (!container.GetCaptures().empty() && container.GetCaptures().front()) {
        KolbaVizCore::VizCapture& capture = *container.GetCaptures().front();
        structure.SetActive(capture, true);
        printShown(out, ("activating capture '" + Narrow(capture.GetName()) + "'").c_str(),
                   container);
    }
    if (!container.GetViews().empty() && container.GetViews().front()) {
        KolbaVizCore::VizView& view = *container.GetViews().front();
        structure.SetActive(view, true);
        printShown(out, ("activating view '" + Narrow(view.GetName()) + "'").c_str(), container);
    }
}

} // namespace VizBridgeExamples
