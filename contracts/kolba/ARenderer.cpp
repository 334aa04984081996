#include <VizBridge/contracts/kolba/ARenderer.h>

#include <VizBridge/contracts/kolba/SceneBuilder.h>

#include <memory>

namespace KolbaVizCore {

ARenderer::ARenderer(SceneBuilder* builder, IRendererReportProvider* reportProvider)
    : m_builder(builder), m_reportProvider(reportProvider) {}

// A copy never owns the builder: two owners would delete it twice.
ARenderer::ARenderer(ARenderer const& other)
    : IRendererReportProvider(other), m_builder(other.m_builder),
      m_reportProvider(other.m_reportProvider), m_reportMode(other.m_reportMode),
      m_report(other.m_report), m_renderId(other.m_renderId),
      m_progressCallback(other.m_progressCallback) {}

ARenderer& ARenderer::operator=(ARenderer const& other) {
    if (this == &other)
        return *this;
    if (m_ownsBuilder && m_builder != other.m_builder) {
        std::unique_ptr<SceneBuilder> const released(m_builder); // the one owner lets go
    }
    m_builder = other.m_builder;
    m_ownsBuilder = false;
    m_reportProvider = other.m_reportProvider;
    m_reportMode = other.m_reportMode;
    m_report = other.m_report;
    m_renderId = other.m_renderId;
    m_progressCallback = other.m_progressCallback;
    return *this;
}

ARenderer::~ARenderer() {
    if (m_ownsBuilder) {
        std::unique_ptr<SceneBuilder> const released(m_builder); // owned: deleted here
    }
}

void ARenderer::SetReportMode(bool const& on) {
    m_reportMode = on;
}

bool ARenderer::GetReportMode() const {
    return m_reportMode || (m_reportProvider != nullptr && m_reportProvider->GetReportMode());
}

void ARenderer::ClearReport() {
    m_report.clear();
}

VizPort::WString ARenderer::GetReport() const {
    return m_report;
}

bool ARenderer::Activate(RenderId&) {
    return false;
}

VizPort::WString ARenderer::GetToolTip(RenderId const&) {
    return VizPort::WString();
}

AGeometryItemFactory* ARenderer::getGeometryItemFactory() const {
    return m_builder != nullptr ? m_builder->GetGeometryItemFactory() : nullptr;
}

AView3DAdapter* ARenderer::getView3DAdapter() const {
    return m_builder != nullptr ? m_builder->GetView3DAdapter() : nullptr;
}

void ARenderer::addToReport(VizPort::WString const& line) {
    if (!GetReportMode())
        return;
    m_report += line;
    m_report += u'\n';
}

} // namespace KolbaVizCore
