#include <VizBridge/contracts/kolba/EntityTypeContext.h>

namespace KolbaVizCore {

EntityTypeContext::EntityTypeContext(SceneBuilder* builder, EntityType type,
                                     VizPort::WString const& name)
    : ASceneBuilderContext(builder) {
    openLevel(ContextKind::EntityType, type, name);
}

} // namespace KolbaVizCore
