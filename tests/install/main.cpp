// Makes a one-part structure around a host's own container through the installed headers
// and libraries, and checks what came out; then makes the installed reference modeler.

#include <VizBridge/import/UniqueProductStructure.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/model/VizPartContainer.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/referencemodeler/ReferenceModelerServices.h>

#include <iostream>
#include <memory>

namespace {

using VizBridgeTarvex::VizDocumentInfo;
using VizBridgeTarvex::VizPartContainer;
using VizBridgeTarvex::VizProductStructure;

/// The smallest modeler container a host could have.
class ConsumerPart : public VizPartContainer {
public:
    ConsumerPart() : VizPartContainer(u"ConsumerPart", 1) {}
    void ReleaseModelerData() override {}
    char const* GetModelerTypeName() const override { return "Consumer"; }
    bool IsModelerDataValid() const override { return true; }
};

} // namespace

int main() {
    VizDocumentInfo info;
    info.productName = u"ConsumerProduct";
    std::unique_ptr<VizProductStructure> const structure =
        VizBridgeTarvex::MakeUniqueVizProductStructure(info, std::make_unique<ConsumerPart>());
    VizReferenceModeler::ReferenceModelerServices modeler;

    bool const ok = structure != nullptr && structure->GetProductName() == u"ConsumerProduct" &&
                    structure->GetChildren().size() == 1 &&
                    structure->GetNumberOfVizPartContainers() == 1 &&
                    structure->GetVizPartContainer(1)->GetTypeName() == "Consumer BREP Container" &&
                    modeler.GetName() == u"Reference Modeler";
    std::cout << (ok ? "consumer: VizBridge works from its install\n"
                     : "consumer: unexpected structure\n");
    return ok ? 0 : 1;
}
