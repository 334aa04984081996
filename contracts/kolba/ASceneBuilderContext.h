#pragma once

#include <VizBridge/contracts/kolba/ContextKind.h>
#include <VizBridge/contracts/kolba/RGBAColor.h>
#include <VizBridge/contracts/platform/WString.h>

#include <cstdint>

namespace KolbaVizCore {

class Node;
class SceneBuilder;

/// Base of the builder contexts: each opens one level of a SceneBuilder when it is made and
/// closes it when it is destroyed, also when an exception passes through. A context that
/// could not open its level (no builder, no current node to open below, or refused by the
/// builder's fault plan) is not OK; what should stand below it is meant to be skipped.
/// Contexts are local objects: they can be neither copied nor moved. The builder is not
/// owned and must outlive the context.
class ASceneBuilderContext {
public:
    ASceneBuilderContext(ASceneBuilderContext const&) = delete;
    ASceneBuilderContext& operator=(ASceneBuilderContext const&) = delete;
    virtual ~ASceneBuilderContext();

    /// True if the level was opened.
    bool IsOK() const { return m_ok; }

protected:
    explicit ASceneBuilderContext(SceneBuilder* builder) : m_builder(builder) {}

    /// Opens a construction bracket.
    void openConstruction();
    /// Opens a node level; see SceneBuilder for when a node is reused.
    void openLevel(ContextKind kind, std::uint32_t tag, VizPort::WString const& name,
                   std::uint32_t containerType = 0);
    /// Gives the level just opened its own colour; nothing if the context is not OK.
    void colorLevel(RGBAColor const& color);

private:
    SceneBuilder* m_builder; ///< not owned
    Node* m_node = nullptr;  ///< the level opened; owned by the builder
    bool m_ok = false;
};

} // namespace KolbaVizCore
