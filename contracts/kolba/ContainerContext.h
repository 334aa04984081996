#pragma once

#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>

namespace KolbaVizCore {

/// Opens a container node below the current node; `containerType` is kept on the node.
class ContainerContext : public ASceneBuilderContext {
public:
    ContainerContext(SceneBuilder* builder, std::uint32_t tag, VizPort::WString const& name,
                     std::uint32_t containerType);
};

} // namespace KolbaVizCore
