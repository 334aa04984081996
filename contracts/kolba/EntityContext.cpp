#include <VizBridge/contracts/kolba/EntityContext.h>

namespace KolbaVizCore {

EntityContext::EntityContext(SceneBuilder* builder, std::uint32_t id, VizPort::WString const& name,
                             bool hasColor, RGBAColor const& color)
    : ASceneBuilderContext(builder) {
    openLevel(ContextKind::Entity, id, name);
    if (hasColor)
        colorLevel(color);
}

} // namespace KolbaVizCore
