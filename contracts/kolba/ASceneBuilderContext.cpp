#include <VizBridge/contracts/kolba/ASceneBuilderContext.h>

#include <VizBridge/contracts/kolba/SceneBuilder.h>

namespace KolbaVizCore {

ASceneBuilderContext::~ASceneBuilderContext() {
    if (!m_ok)
        return;
    if (m_node == nullptr)
        m_builder->endConstruction();
    else
        m_builder->closeLevel(m_node);
}

void ASceneBuilderContext::openConstruction() {
    m_ok = m_builder != nullptr && m_builder->beginConstruction();
}

void ASceneBuilderContext::openLevel(ContextKind kind, std::uint32_t tag,
                                     VizPort::WString const& name, std::uint32_t containerType) {
    if (m_builder != nullptr)
        m_node = m_builder->openLevel(kind, tag, name, containerType);
    m_ok = m_node != nullptr;
}

void ASceneBuilderContext::colorLevel(RGBAColor const& color) {
    if (m_ok && m_node != nullptr)
        m_builder->colorNode(m_node, color, false);
}

} // namespace KolbaVizCore
