#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIDIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuView;

/// A view: a named group of annotations in a plane. A default object is an empty view
/// without names.
class TarvexVisuView {
public:
    TarvexVisuView() = default;
    TarvexVisuView(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuView const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    bool GetHidden(bool& hidden) const;
    /// No text when the view has no display name.
    TarvexWString GetDisplayName() const;
    bool GetID(TarvexWString& id) const;
    bool GetMechanicalID(TarvexWString& id) const;
    /// True and the plane's origin, first and second direction, three floats each, when the
    /// view has a plane; the arrays are left alone when it has none.
    bool GetViewAxis(float* const origin, float* const first, float* const second) const;
    /// The ids of the annotations the view groups.
    TarvexVisuIDIter GetAnnotationIDIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuView const> m_record; ///< shares the import's data
};
