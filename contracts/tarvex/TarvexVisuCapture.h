#pragma once

#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCamera.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIDIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuCapture;

/// A capture: a named group of annotations and constructed geometry, seen by a camera, with
/// possibly a clipping plane and the bodies that it shows. A default object is an empty
/// capture without names, with a camera of unknown type.
class TarvexVisuCapture {
public:
    TarvexVisuCapture() = default;
    TarvexVisuCapture(TarvexVisuContext context,
                      std::shared_ptr<TarvexAuthoredVisuCapture const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    bool GetHidden(bool& hidden) const;
    bool GetActive(bool& active) const;
    TarvexVisuCamera GetCamera() const;
    /// No text when the capture has no display name.
    TarvexWString GetDisplayName() const;
    bool GetID(TarvexWString& id) const;
    bool GetMechanicalID(TarvexWString& id) const;
    /// No text when the capture has none.
    TarvexWString GetHiddenText() const;
    /// True and the plane's origin, normal and first in-plane direction, three floats each,
    /// when the capture clips; the arrays are left alone when it does not.
    bool GetClippingPlane(float* const origin, float* const normal, float* const first) const;
    TarvexVisuIDIter GetAnnotationIDIterator() const;
    /// The ids of the constructed geometry of the PMI that the capture shows.
    TarvexVisuIDIter GetFTACGIDIterator() const;
    /// Whether the capture decides which bodies show.
    bool GetManagesGeometry() const;
    /// The bodies that the capture shows; read them only when it manages geometry.
    TarvexEntityIter GetBodyIDIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuCapture const> m_record; ///< shares the import's data
};
