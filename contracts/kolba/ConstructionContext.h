#pragma once

#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>

namespace KolbaVizCore {

/// Brackets one construction of the scene; opens no node.
class ConstructionContext : public ASceneBuilderContext {
public:
    ConstructionContext(SceneBuilder* builder);
};

} // namespace KolbaVizCore
