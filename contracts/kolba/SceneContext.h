#pragma once

#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>

namespace KolbaVizCore {

/// Opens a scene top, whatever node is current.
class SceneContext : public ASceneBuilderContext {
public:
    SceneContext(SceneBuilder* builder, std::uint32_t tag, VizPort::WString const& name);
};

} // namespace KolbaVizCore
