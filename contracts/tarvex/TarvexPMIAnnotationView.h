#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIObject.h>

class TarvexPMIAnnotationIter;
struct TarvexAuthoredPMIAnnotationView;

/// An annotation view: a plane and the annotations drawn in it.
class TarvexPMIAnnotationView : public TarvexPMIObject {
public:
    TarvexPMIAnnotationView() = default;
    TarvexPMIAnnotationView(TarvexVisuContext context,
                            std::shared_ptr<TarvexAuthoredPMIAnnotationView const> record);

    /// True and origin, first and second direction (three floats each) filled when the view
    /// has a plane; the arrays are left alone when it has none.
    bool GetAxis(float* const origin, float* const uDirection, float* const vDirection) const;
    TarvexPMIAnnotationIter GetAnnotationIterator() const;
};
