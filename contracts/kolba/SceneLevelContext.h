#pragma once

#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>

namespace KolbaVizCore {

/// Opens a plain level below the current node.
class SceneLevelContext : public ASceneBuilderContext {
public:
    SceneLevelContext(SceneBuilder* builder, std::uint32_t tag, VizPort::WString const& name);
};

} // namespace KolbaVizCore
