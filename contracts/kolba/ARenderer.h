#pragma once

#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/IRendererReportProvider.h>
#include <VizBridge/contracts/kolba/RenderId.h>
#include <VizBridge/contracts/platform/WString.h>

namespace KolbaVizCore {

class AGeometryItemFactory;
class AView3DAdapter;
class SceneBuilder;

/// Base of every renderer: draws something into a SceneBuilder when asked, and afterwards
/// converts between the paths it drew and the entity ids of an application.
///
/// The renderer points at its SceneBuilder and, unless SetBuilderOwnership(true) was called,
/// does not own it: the host deletes the renderer first, then the builder. An owning
/// renderer deletes the builder in its destructor, after the derived destructors have
/// run. A copy shares the builder without owning it.
///
/// With a report provider, the renderer reports whenever that provider is in report mode,
/// so that the sub-renderers of one renderer follow its mode; the text stays in each
/// renderer's own report.
class ARenderer : public IRendererReportProvider {
public:
    /// Called as (done, total, phase) while a render runs; phase is a narrow text.
    using ProgressCallback = void (*)(int const& done, int const& total, char const* phase);

    /// Both pointers may be null; neither is owned.
    ARenderer(SceneBuilder* builder, IRendererReportProvider* reportProvider);
    ARenderer(ARenderer const& other);
    ARenderer& operator=(ARenderer const& other);

    void SetReportMode(bool const& on) override;
    bool GetReportMode() const override;
    void ClearReport() override;
    VizPort::WString GetReport() const override;

    virtual ~ARenderer();

    /// Draws into the builder; true if it worked.
    virtual bool Render() = 0;
    /// Forgets what was drawn.
    virtual void ClearAll() = 0;
    virtual bool Convert(RenderId const& id, EntityId& entity) = 0;
    virtual bool Convert(EntityId const& entity, RenderId& id) = 0;
    /// On true, `ids` is a new array of `count` paths that belongs to the caller, who
    /// releases it with delete[].
    virtual bool ConvertToHighlight(RenderId const& id, RenderId*& ids, int& count) = 0;
    /// Makes what `id` names the active object; this base has nothing to activate: false.
    virtual bool Activate(RenderId& id);
    /// Three floats.
    virtual void GetGeometryCenter(float* const center) const = 0;
    virtual float GetGeometryRadius() const = 0;
    /// Six floats: the low corner, then the high corner of what was drawn.
    virtual void GetGeometryBox(float* const box) const = 0;
    /// A text for what `id` names; empty when there is nothing to say, as in this base.
    virtual VizPort::WString GetToolTip(RenderId const& id);

    /// The path below which this renderer drew; empty before a render.
    RenderId const& GetRenderId() const { return m_renderId; }

    /// Whether the destructor deletes the builder. False unless set.
    void SetBuilderOwnership(bool owns) { m_ownsBuilder = owns; }
    bool GetBuilderOwnership() const { return m_ownsBuilder; }

    /// Null: no progress calls.
    void SetProgressCallback(ProgressCallback callback) { m_progressCallback = callback; }
    ProgressCallback GetProgressCallback() const { return m_progressCallback; }

protected:
    virtual bool preRender() = 0;
    virtual void postRender() = 0;

    SceneBuilder* getSceneBuilder() const { return m_builder; }
    /// The builder's factory; null without a builder, or when the builder has none.
    AGeometryItemFactory* getGeometryItemFactory() const;
    /// The builder's view adapter; may be null.
    AView3DAdapter* getView3DAdapter() const;
    void setRenderId(RenderId const& id) { m_renderId = id; }
    RenderId& renderId() { return m_renderId; }
    /// Appends `line` and a line feed to the report while report mode is on.
    void addToReport(VizPort::WString const& line);

private:
    SceneBuilder* m_builder;                   ///< owned only if m_ownsBuilder
    IRendererReportProvider* m_reportProvider; ///< not owned
    bool m_ownsBuilder = false;
    bool m_reportMode = false;
    VizPort::WString m_report;
    RenderId m_renderId;
    ProgressCallback m_progressCallback = nullptr;
};

} // namespace KolbaVizCore
