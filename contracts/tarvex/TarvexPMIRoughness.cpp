#include <VizBridge/contracts/tarvex/TarvexPMIRoughness.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>

TarvexPMIRoughness::TarvexPMIRoughness(TarvexVisuContext context,
                                       std::shared_ptr<TarvexAuthoredPMIRoughness const> record)
    : TarvexPMIAnnotation(std::move(context), std::move(record)) {}

TarvexAuthoredPMIRoughness const& TarvexPMIRoughness::roughness(char const* operation) const {
    static TarvexAuthoredPMIRoughness const empty;
    auto const* record = read<TarvexAuthoredPMIRoughness>(operation);
    return record ? *record : empty;
}

TarvexPMIAnnotationType TarvexPMIRoughness::GetObjectType() const {
    roughness("TarvexPMIAnnotation::GetObjectType");
    return TarvexPMI_Roughness;
}

TarvexPMIRoughnessObtentionType TarvexPMIRoughness::GetRoughnessObtention() const {
    return roughness("TarvexPMIRoughness::GetRoughnessObtention").obtention;
}

TarvexPMIRoughnessApplicabilityType TarvexPMIRoughness::GetRoughnessApplicability() const {
    return roughness("TarvexPMIRoughness::GetRoughnessApplicability").applicability;
}

int TarvexPMIRoughness::GetRoughnessFieldCount() const {
    return static_cast<int>(roughness("TarvexPMIRoughness::GetRoughnessFieldCount").fields.size());
}

TarvexWString TarvexPMIRoughness::GetRoughnessFieldAt(int index) const {
    auto const& fields = roughness("TarvexPMIRoughness::GetRoughnessFieldAt").fields;
    if (index < 0 || index >= static_cast<int>(fields.size())) {
        return TarvexWString();
    }
    return TarvexWString(fields[static_cast<std::size_t>(index)]);
}
