#include <VizBridge/contracts/kolba/ContainerContext.h>

namespace KolbaVizCore {

ContainerContext::ContainerContext(SceneBuilder* builder, std::uint32_t tag,
                                   VizPort::WString const& name, std::uint32_t containerType)
    : ASceneBuilderContext(builder) {
    openLevel(ContextKind::Container, tag, name, containerType);
}

} // namespace KolbaVizCore
