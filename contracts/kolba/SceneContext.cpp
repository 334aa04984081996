#include <VizBridge/contracts/kolba/SceneContext.h>

namespace KolbaVizCore {

SceneContext::SceneContext(SceneBuilder* builder, std::uint32_t tag, VizPort::WString const& name)
    : ASceneBuilderContext(builder) {
    openLevel(ContextKind::Scene, tag, name);
}

} // namespace KolbaVizCore
