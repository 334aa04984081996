#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>

struct TarvexAuthoredPMIRoughness;

/// A surface roughness symbol: how the surface is obtained, where the symbol applies, and
/// its text fields.
class TarvexPMIRoughness : public TarvexPMIAnnotation {
public:
    TarvexPMIRoughness() = default;
    TarvexPMIRoughness(TarvexVisuContext context,
                       std::shared_ptr<TarvexAuthoredPMIRoughness const> record);

    TarvexPMIAnnotationType GetObjectType() const override;
    TarvexPMIRoughnessObtentionType GetRoughnessObtention() const;
    TarvexPMIRoughnessApplicabilityType GetRoughnessApplicability() const;
    int GetRoughnessFieldCount() const;
    /// Field `index` (from 0); no text out of range.
    TarvexWString GetRoughnessFieldAt(int index) const;

private:
    TarvexAuthoredPMIRoughness const& roughness(char const* operation) const;
};
