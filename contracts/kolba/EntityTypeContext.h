#pragma once

#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>
#include <VizBridge/contracts/kolba/EntityType.h>

namespace KolbaVizCore {

/// Opens the node of one kind of entity below the current node; the type is its tag.
class EntityTypeContext : public ASceneBuilderContext {
public:
    EntityTypeContext(SceneBuilder* builder, EntityType type, VizPort::WString const& name);
};

} // namespace KolbaVizCore
