#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>

struct TarvexAuthoredPMIDatumTarget;

/// A datum target: a point, line or area of a part that a datum is taken from.
class TarvexPMIDatumTarget : public TarvexPMIAnnotation {
public:
    TarvexPMIDatumTarget() = default;
    TarvexPMIDatumTarget(TarvexVisuContext context,
                         std::shared_ptr<TarvexAuthoredPMIDatumTarget const> record);

    TarvexPMIAnnotationType GetObjectType() const override;
    TarvexWString GetLabel() const;
    /// Always fills every argument: the target's type, whether it has a diameter, the
    /// upper and lower texts, and two positions of three floats each.
    void GetInfo(TarvexPMIDatumTargetType& type, bool& hasDiameter, TarvexWString& upper,
                 TarvexWString& lower, float* const position1, float* const position2) const;
};
