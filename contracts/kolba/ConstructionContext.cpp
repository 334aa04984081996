#include <VizBridge/contracts/kolba/ConstructionContext.h>

namespace KolbaVizCore {

ConstructionContext::ConstructionContext(SceneBuilder* builder) : ASceneBuilderContext(builder) {
    openConstruction();
}

} // namespace KolbaVizCore
