#pragma once

#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>

class TarvexPMIDatumTargetIter;
struct TarvexAuthoredPMIDatum;

/// A datum feature: its label and the targets it is taken from.
class TarvexPMIDatum : public TarvexPMIAnnotation {
public:
    TarvexPMIDatum() = default;
    TarvexPMIDatum(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredPMIDatum const> record);

    TarvexPMIAnnotationType GetObjectType() const override;
    TarvexWString GetLabel() const;
    TarvexPMIDatumTargetIter GetDatumTargetIterator() const;
};
