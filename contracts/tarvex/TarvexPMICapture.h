#pragma once

#include <VizBridge/contracts/tarvex/TarvexEntityIter.h>
#include <VizBridge/contracts/tarvex/TarvexPMIObject.h>
#include <VizBridge/contracts/tarvex/TarvexPMITypes.h>

class TarvexPMIAnnotationIter;
struct TarvexAuthoredPMICapture;

/// A capture: a stored state of the display, with its camera, a clipping plane, the
/// annotations it shows and possibly the bodies it shows.
class TarvexPMICapture : public TarvexPMIObject {
public:
    TarvexPMICapture() = default;
    TarvexPMICapture(TarvexVisuContext context,
                     std::shared_ptr<TarvexAuthoredPMICapture const> record);

    void GetAttributes(bool& hidden, bool& current, TarvexWString& hiddenText) const;
    /// Camera name, type (0: unknown), position, target and up direction (three floats
    /// each), angle and zoom; always filled.
    void GetCamera(TarvexWString& name, TarvexPMICameraType& type, float* const position,
                   float* const target, float* const upDirection, float& angle, float& zoom) const;
    /// True and origin and normal (three floats each) filled when the capture clips.
    bool GetClippingPlane(float* const origin, float* const normal) const;
    TarvexPMIAnnotationIter GetAnnotationIterator() const;
    bool GetManageHideShowBodyFlag() const;
    TarvexEntityIter GetBodyIterator() const;

private:
    TarvexAuthoredPMICapture const& capture(char const* operation) const;
};
