#include <VizBridge/contracts/tarvex/TarvexPMIGDT.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>

namespace {
TarvexAuthoredPMICompositeTolerance const& secondLine(TarvexAuthoredPMIGDT const& record) {
    static TarvexAuthoredPMICompositeTolerance const none;
    return record.composite ? *record.composite : none;
}
} // namespace

TarvexPMIGDT::TarvexPMIGDT(TarvexVisuContext context,
                           std::shared_ptr<TarvexAuthoredPMIGDT const> record)
    : TarvexPMIAnnotation(std::move(context), std::move(record)) {}

TarvexAuthoredPMIGDT const& TarvexPMIGDT::tolerance(char const* operation) const {
    static TarvexAuthoredPMIGDT const empty;
    auto const* record = read<TarvexAuthoredPMIGDT>(operation);
    return record ? *record : empty;
}

TarvexPMIAnnotationType TarvexPMIGDT::GetObjectType() const {
    tolerance("TarvexPMIAnnotation::GetObjectType");
    return TarvexPMI_GDT;
}

void TarvexPMIGDT::GetToleranceInfo(TarvexPMIToleranceType& type,
                                    TarvexPMIToleranceValueType& valueType, double& value,
                                    double& refinement, double& rateUnit1, double& rateUnit2,
                                    double& projectedZoneLength, double& shift, bool& allAround,
                                    TarvexWString& note) const {
    auto const& record = tolerance("TarvexPMIGDT::GetToleranceInfo");
    type = record.toleranceType;
    valueType = record.valueType;
    value = record.value;
    refinement = record.refinement;
    rateUnit1 = record.rateUnit1;
    rateUnit2 = record.rateUnit2;
    projectedZoneLength = record.projectedZoneLength;
    shift = record.shift;
    allAround = record.allAround;
    note = TarvexWString(record.note);
}

void TarvexPMIGDT::GetModifiers(TarvexPMIToleranceModifier& first,
                                TarvexPMIToleranceModifier& second) const {
    auto const& record = tolerance("TarvexPMIGDT::GetModifiers");
    first = record.modifier1;
    second = record.modifier2;
}

TarvexPMIGDTRefFrame TarvexPMIGDT::GetRefFrame() const {
    auto const& record = tolerance("TarvexPMIGDT::GetRefFrame");
    return TarvexPMIGDTRefFrame(context(), share(record.refFrame));
}

bool TarvexPMIGDT::IsComposite() const {
    return tolerance("TarvexPMIGDT::IsComposite").composite.has_value();
}

void TarvexPMIGDT::GetCompositeToleranceInfo(TarvexPMIToleranceValueType& valueType, double& value,
                                             double& rateUnit1, double& rateUnit2) const {
    auto const& line = secondLine(tolerance("TarvexPMIGDT::GetCompositeToleranceInfo"));
    valueType = line.valueType;
    value = line.value;
    rateUnit1 = line.rateUnit1;
    rateUnit2 = line.rateUnit2;
}

void TarvexPMIGDT::GetCompositeModifier(TarvexPMIToleranceModifier& modifier) const {
    modifier = secondLine(tolerance("TarvexPMIGDT::GetCompositeModifier")).modifier;
}

TarvexPMIGDTRefFrame TarvexPMIGDT::GetCompositeRefFrame() const {
    auto const& line = secondLine(tolerance("TarvexPMIGDT::GetCompositeRefFrame"));
    return TarvexPMIGDTRefFrame(context(), share(line.refFrame));
}
