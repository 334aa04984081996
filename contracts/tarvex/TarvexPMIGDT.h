#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/contracts/tarvex/TarvexPMIGDTRefFrame.h>

struct TarvexAuthoredPMIGDT;

/// A geometrical tolerance frame: the main line of values, two modifiers and a datum
/// reference frame, and for a composite tolerance a second line with its own value, modifier
/// and frame. The second line's getters answer for an empty line when there is none.
class TarvexPMIGDT : public TarvexPMIAnnotation {
public:
    TarvexPMIGDT() = default;
    TarvexPMIGDT(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredPMIGDT const> record);

    TarvexPMIAnnotationType GetObjectType() const override;
    void GetToleranceInfo(TarvexPMIToleranceType& type, TarvexPMIToleranceValueType& valueType,
                          double& value, double& refinement, double& rateUnit1, double& rateUnit2,
                          double& projectedZoneLength, double& shift, bool& allAround,
                          TarvexWString& note) const;
    void GetModifiers(TarvexPMIToleranceModifier& first, TarvexPMIToleranceModifier& second) const;
    TarvexPMIGDTRefFrame GetRefFrame() const;
    bool IsComposite() const;
    void GetCompositeToleranceInfo(TarvexPMIToleranceValueType& valueType, double& value,
                                   double& rateUnit1, double& rateUnit2) const;
    void GetCompositeModifier(TarvexPMIToleranceModifier& modifier) const;
    TarvexPMIGDTRefFrame GetCompositeRefFrame() const;

private:
    /// The record, or an empty tolerance for a default object, after checking `operation`.
    TarvexAuthoredPMIGDT const& tolerance(char const* operation) const;
};
