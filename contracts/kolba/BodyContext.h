#pragma once

#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>

namespace KolbaVizCore {

/// Opens the node of one body below the current node.
class BodyContext : public ASceneBuilderContext {
public:
    BodyContext(SceneBuilder* builder, std::uint32_t tag, VizPort::WString const& name);
};

} // namespace KolbaVizCore
