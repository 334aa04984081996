#include <VizBridge/semantic/VizDimensionSemanticPMILoader.h>

#include <VizBridge/semantic/PMIVocabulary.h>
#include <VizBridge/semantic/SemanticFormat.h>

namespace VizBridgeTarvex {

void VizDimensionSemanticPMILoader::LoadSemantics() {
    VizAnnotationPMILoader::LoadSemantics();
    auto const& dimension = object<TarvexPMIDimension>();
    loadValue(dimension);
    loadTexts(dimension);
    write(u"DrivingDim", FormatBool(dimension.IsDriving()));
    loadLine(dimension);
}

void VizDimensionSemanticPMILoader::loadValue(TarvexPMIDimension const& dimension) {
    TarvexPMIDimensionMainType mainType = TarvexPMI_DMT_Unknown;
    TarvexPMIDimensionSubType subType = TarvexPMI_Distance;
    dimension.GetType(mainType, subType);
    write(u"MainType", DimensionMainTypeToText(mainType));
    write(u"SubType", DimensionSubTypeToText(subType));

    double coordinate[3] = {0, 0, 0};
    dimension.GetCoordValue(coordinate[0], coordinate[1], coordinate[2]);
    write(u"Coordinate", FormatDoubles(3, coordinate));

    // The precision is a number of the record: it does not steer how the value prints.
    double value = 0;
    TarvexPMIUnit unit = TarvexPMI_DimUnitNone;
    double precision = 0;
    dimension.GetValue(value, unit, precision);
    write(u"Value", FormatDouble(value));
    write(u"Unit", UnitToText(unit));
    write(u"Precision", FormatDouble(precision));

    double upper = 0;
    double lower = 0;
    if (dimension.GetNumericalTolerances(upper, lower)) {
        write(u"UpperVal", FormatDouble(upper));
        write(u"LowerVal", FormatDouble(lower));
    }
    TarvexWString upperText(u"");
    TarvexWString lowerText(u"");
    if (dimension.GetAlphanumericalTolerances(upperText, lowerText)) {
        write(u"UpperString", ToWString(upperText));
        write(u"LowerString", ToWString(lowerText));
    }
}

void VizDimensionSemanticPMILoader::loadTexts(TarvexPMIDimension const& dimension) {
    TarvexWString texts[6] = {u"", u"", u"", u"", u"", u""};
    if (dimension.GetTexts(texts[0], texts[1], texts[2], texts[3], texts[4], texts[5])) {
        char16_t const* const keys[6] = {u"Prefix", u"Suffix", u"Before",
                                         u"After",  u"Upper",  u"Lower"};
        for (int index = 0; index < 6; ++index) {
            write(keys[index], ToWString(texts[index]));
        }
    }
    double fakeValue = 0;
    if (dimension.GetFakeNumericalValue(fakeValue)) {
        write(u"FakeValue", FormatDouble(fakeValue));
    }
    TarvexWString fakeText(u"");
    if (dimension.GetFakeAlphanumericalValue(fakeText)) {
        write(u"FakeString", ToWString(fakeText));
    }
}

void VizDimensionSemanticPMILoader::loadLine(TarvexPMIDimension const& dimension) {
    float start[2] = {0, 0};
    float end[2] = {0, 0};
    TarvexPMIArrowSymbol startSymbol = TarvexPMI_NOTUSED;
    TarvexPMIArrowSymbol endSymbol = TarvexPMI_NOTUSED;
    bool reversed = false;
    dimension.GetDimensionLine(start, end, startSymbol, endSymbol, reversed);
    write(u"LineStart", FormatFloats(2, start));
    write(u"LineEnd", FormatFloats(2, end));
    write(u"LineSymbolStart", ArrowSymbolToText(startSymbol));
    write(u"LineSymbolEnd", ArrowSymbolToText(endSymbol));
    write(u"IsReversed", FormatBool(reversed));
}

} // namespace VizBridgeTarvex
