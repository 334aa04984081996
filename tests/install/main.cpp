// Makes a one-part structure around a host's own container through the installed headers
// and library, and checks what came out.

#include "import/VizBuilder.h"
#include "model/VizPSEntry.h"
#include "model/VizPartContainer.h"
#include "model/VizProductStructure.h"

#include <iostream>
#include <memory>

namespace {

using VizBridgeTarvex::VizBuilder;
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
    VizProductStructure* raw = nullptr;
    // The structure takes the container; the host takes the structure.
    VizBuilder::MakeVizProductStructure(info, std::make_unique<ConsumerPart>().release(), raw);
    std::unique_ptr<VizProductStructure> const structure(raw);

    bool const ok = structure != nullptr && structure->GetProductName() == u"ConsumerProduct" &&
                    structure->GetChildren().size() == 1 &&
                    structure->GetNumberOfVizPartContainers() == 1 &&
                    structure->GetVizPartContainer(1)->GetTypeName() == "Consumer BREP Container";
    std::cout << (ok ? "consumer: VizBridge works from its install\n"
                     : "consumer: unexpected structure\n");
    return ok ? 0 : 1;
}
