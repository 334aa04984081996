#include <VizBridge/contracts/tarvex/TarvexPMIDatum.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumTargetIter.h>

TarvexPMIDatum::TarvexPMIDatum(TarvexVisuContext context,
                               std::shared_ptr<TarvexAuthoredPMIDatum const> record)
    : TarvexPMIAnnotation(std::move(context), std::move(record)) {}

TarvexPMIAnnotationType TarvexPMIDatum::GetObjectType() const {
    read<TarvexAuthoredPMIDatum>("TarvexPMIAnnotation::GetObjectType");
    return TarvexPMI_Datum;
}

TarvexWString TarvexPMIDatum::GetLabel() const {
    auto const* record = read<TarvexAuthoredPMIDatum>("TarvexPMIDatum::GetLabel");
    return record ? TarvexWString(record->label) : TarvexWString();
}

TarvexPMIDatumTargetIter TarvexPMIDatum::GetDatumTargetIterator() const {
    auto const* record = read<TarvexAuthoredPMIDatum>("TarvexPMIDatum::GetDatumTargetIterator");
    return record ? TarvexPMIDatumTargetIter(context(), share(record->targets))
                  : TarvexPMIDatumTargetIter();
}
