#pragma once

#include <cstdint>

namespace KolbaVizCore {

/// Which kind of builder context opened a level. A scene node keeps the kind of the context
/// that made it; `Construction` brackets a whole construction and makes no node.
enum class ContextKind : std::uint8_t {
    Construction,
    Scene,
    Container,
    SceneLevel,
    EntityType,
    Body,
    Entity,
};

} // namespace KolbaVizCore
