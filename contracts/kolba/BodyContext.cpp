#include <VizBridge/contracts/kolba/BodyContext.h>

namespace KolbaVizCore {

BodyContext::BodyContext(SceneBuilder* builder, std::uint32_t tag, VizPort::WString const& name)
    : ASceneBuilderContext(builder) {
    openLevel(ContextKind::Body, tag, name);
}

} // namespace KolbaVizCore
