#pragma once

#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>

namespace KolbaVizCore {

/// Opens a new node of one entity below the current node, never reusing one: entities of
/// one body may share an id. With `hasColor` the node takes `color` as its own.
class EntityContext : public ASceneBuilderContext {
public:
    EntityContext(SceneBuilder* builder, std::uint32_t id, VizPort::WString const& name,
                  bool hasColor, RGBAColor const& color);
};

} // namespace KolbaVizCore
