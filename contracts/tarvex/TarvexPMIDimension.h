#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>

struct TarvexAuthoredPMIDimension;

/// A dimension: its value with unit and precision, its tolerances and texts, and its line.
/// The getters that answer with a bool leave their arguments alone when they answer false.
class TarvexPMIDimension : public TarvexPMIAnnotation {
public:
    TarvexPMIDimension() = default;
    TarvexPMIDimension(TarvexVisuContext context,
                       std::shared_ptr<TarvexAuthoredPMIDimension const> record);

    TarvexPMIAnnotationType GetObjectType() const override;
    void GetType(TarvexPMIDimensionMainType& mainType, TarvexPMIDimensionSubType& subType) const;
    void GetCoordValue(double& x, double& y, double& z) const;
    void GetValue(double& value, TarvexPMIUnit& unit, double& precision) const;
    bool GetNumericalTolerances(double& upper, double& lower) const;
    bool GetAlphanumericalTolerances(TarvexWString& upper, TarvexWString& lower) const;
    bool GetTexts(TarvexWString& prefix, TarvexWString& suffix, TarvexWString& before,
                  TarvexWString& after, TarvexWString& upper, TarvexWString& lower) const;
    bool GetFakeNumericalValue(double& value) const;
    bool GetFakeAlphanumericalValue(TarvexWString& value) const;
    bool IsDriving() const;
    /// Always fills the line's start and end (two floats each), its end symbols and whether
    /// it is reversed.
    void GetDimensionLine(float* const start, float* const end, TarvexPMIArrowSymbol& startSymbol,
                          TarvexPMIArrowSymbol& endSymbol, bool& reversed) const;

private:
    /// The record, or an empty dimension for a default object, after checking `operation`.
    TarvexAuthoredPMIDimension const& dimension(char const* operation) const;
};
