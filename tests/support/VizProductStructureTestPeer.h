#pragma once

#include <VizBridge/model/VizPartContainer.h>
#include <VizBridge/model/VizProductStructure.h>

#include <memory>

namespace VizBridgeTarvex {

/// Fills a structure directly, as the import phases do, for tests of the structure itself.
class VizProductStructureTestPeer {
public:
    static std::unique_ptr<VizProductStructure> make(char16_t const* name) {
        return std::unique_ptr<VizProductStructure>(new VizProductStructure(name));
    }
    static void addVizContainer(VizProductStructure& s, int id, VizContainer* c) {
        s.AddVizContainer(id, std::unique_ptr<VizContainer>(c));
    }
    static void addPMIContainer(VizProductStructure& s, int id, VizPMIContainer* c) {
        s.AddVizPMIContainer(id, std::unique_ptr<VizPMIContainer>(c));
    }
    static void addPartContainer(VizProductStructure& s, int id, VizPartContainer* c) {
        s.AddVizPartContainer(id, std::unique_ptr<VizPartContainer>(c));
    }
    static void addSemanticPMI(VizProductStructure& s, int id, SemanticPMIByKey* records) {
        s.AddSemanticPMI(id, records);
    }
    static void setImportError(VizProductStructure& s, int id, WString const& text) {
        s.setImportError(id, text);
    }
    static void setVisuError(VizProductStructure& s, int id, WString const& text) {
        s.setVisuError(id, text);
    }
    static void addMissingFile(VizProductStructure& s, WString const& name) {
        s.addMissingFile(name);
    }
};

} // namespace VizBridgeTarvex
