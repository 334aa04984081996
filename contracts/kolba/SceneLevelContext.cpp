#include <VizBridge/contracts/kolba/SceneLevelContext.h>

namespace KolbaVizCore {

SceneLevelContext::SceneLevelContext(SceneBuilder* builder, std::uint32_t tag,
                                     VizPort::WString const& name)
    : ASceneBuilderContext(builder) {
    openLevel(ContextKind::SceneLevel, tag, name);
}

} // namespace KolbaVizCore
