#include <VizBridge/contracts/tarvex/TarvexPMIDatumTarget.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>

#include <algorithm>

TarvexPMIDatumTarget::TarvexPMIDatumTarget(
    TarvexVisuContext context, std::shared_ptr<TarvexAuthoredPMIDatumTarget const> record)
    : TarvexPMIAnnotation(std::move(context), std::move(record)) {}

TarvexPMIAnnotationType TarvexPMIDatumTarget::GetObjectType() const {
    read<TarvexAuthoredPMIDatumTarget>("TarvexPMIAnnotation::GetObjectType");
    return TarvexPMI_DatumTarget;
}

TarvexWString TarvexPMIDatumTarget::GetLabel() const {
    auto const* record = read<TarvexAuthoredPMIDatumTarget>("TarvexPMIDatumTarget::GetLabel");
    return record ? TarvexWString(record->label) : TarvexWString();
}

void TarvexPMIDatumTarget::GetInfo(TarvexPMIDatumTargetType& type, bool& hasDiameter,
                                   TarvexWString& upper, TarvexWString& lower,
                                   float* const position1, float* const position2) const {
    TarvexAuthoredPMIDatumTarget const empty;
    auto const* record = read<TarvexAuthoredPMIDatumTarget>("TarvexPMIDatumTarget::GetInfo");
    auto const& target = record ? *record : empty;
    type = target.targetType;
    hasDiameter = target.hasDiameter;
    upper = TarvexWString(target.upper);
    lower = TarvexWString(target.lower);
    if (position1) {
        std::copy(target.position1.begin(), target.position1.end(), position1);
    }
    if (position2) {
        std::copy(target.position2.begin(), target.position2.end(), position2);
    }
}
