#include <VizBridge/contracts/tarvex/TarvexPMIDimension.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>

TarvexPMIDimension::TarvexPMIDimension(TarvexVisuContext context,
                                       std::shared_ptr<TarvexAuthoredPMIDimension const> record)
    : TarvexPMIAnnotation(std::move(context), std::move(record)) {}

TarvexAuthoredPMIDimension const& TarvexPMIDimension::dimension(char const* operation) const {
    static TarvexAuthoredPMIDimension const empty;
    auto const* record = read<TarvexAuthoredPMIDimension>(operation);
    return record ? *record : empty;
}

TarvexPMIAnnotationType TarvexPMIDimension::GetObjectType() const {
    dimension("TarvexPMIAnnotation::GetObjectType");
    return TarvexPMI_Dimension;
}

void TarvexPMIDimension::GetType(TarvexPMIDimensionMainType& mainType,
                                 TarvexPMIDimensionSubType& subType) const {
    auto const& record = dimension("TarvexPMIDimension::GetType");
    mainType = record.mainType;
    subType = record.subType;
}

void TarvexPMIDimension::GetCoordValue(double& x, double& y, double& z) const {
    auto const& record = dimension("TarvexPMIDimension::GetCoordValue");
    x = record.coordinate[0];
    y = record.coordinate[1];
    z = record.coordinate[2];
}

void TarvexPMIDimension::GetValue(double& value, TarvexPMIUnit& unit, double& precision) const {
    auto const& record = dimension("TarvexPMIDimension::GetValue");
    value = record.value;
    unit = record.unit;
    precision = record.precision;
}

bool TarvexPMIDimension::GetNumericalTolerances(double& upper, double& lower) const {
    auto const& record = dimension("TarvexPMIDimension::GetNumericalTolerances");
    if (!record.numericalTolerances) {
        return false;
    }
    upper = (*record.numericalTolerances)[0];
    lower = (*record.numericalTolerances)[1];
    return true;
}

bool TarvexPMIDimension::GetAlphanumericalTolerances(TarvexWString& upper,
                                                     TarvexWString& lower) const {
    auto const& record = dimension("TarvexPMIDimension::GetAlphanumericalTolerances");
    if (!record.alphanumericalTolerances) {
        return false;
    }
    upper = TarvexWString((*record.alphanumericalTolerances)[0]);
    lower = TarvexWString((*record.alphanumericalTolerances)[1]);
    return true;
}

bool TarvexPMIDimension::GetTexts(TarvexWString& prefix, TarvexWString& suffix,
                                  TarvexWString& before, TarvexWString& after, TarvexWString& upper,
                                  TarvexWString& lower) const {
    auto const& record = dimension("TarvexPMIDimension::GetTexts");
    if (!record.texts) {
        return false;
    }
    prefix = TarvexWString(record.texts->prefix);
    suffix = TarvexWString(record.texts->suffix);
    before = TarvexWString(record.texts->before);
    after = TarvexWString(record.texts->after);
    upper = TarvexWString(record.texts->upper);
    lower = TarvexWString(record.texts->lower);
    return true;
}

bool TarvexPMIDimension::GetFakeNumericalValue(double& value) const {
    auto const& record = dimension("TarvexPMIDimension::GetFakeNumericalValue");
    if (!record.fakeValue) {
        return false;
    }
    value = *record.fakeValue;
    return true;
}

bool TarvexPMIDimension::GetFakeAlphanumericalValue(TarvexWString& value) const {
    auto const& record = dimension("TarvexPMIDimension::GetFakeAlphanumericalValue");
    if (!record.fakeString) {
        return false;
    }
    value = TarvexWString(*record.fakeString);
    return true;
}

bool TarvexPMIDimension::IsDriving() const {
    return dimension("TarvexPMIDimension::IsDriving").driving;
}

void TarvexPMIDimension::GetDimensionLine(float* const start, float* const end,
                                          TarvexPMIArrowSymbol& startSymbol,
                                          TarvexPMIArrowSymbol& endSymbol, bool& reversed) const {
    auto const& record = dimension("TarvexPMIDimension::GetDimensionLine");
    for (std::size_t i = 0; i < 2; ++i) {
        if (start) {
            start[i] = record.lineStart[i];
        }
        if (end) {
            end[i] = record.lineEnd[i];
        }
    }
    startSymbol = record.symbolStart;
    endSymbol = record.symbolEnd;
    reversed = record.reversed;
}
