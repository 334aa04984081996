#include <VizBridge/semantic/VizGDTSemanticPMILoader.h>

#include <VizBridge/contracts/tarvex/TarvexPMIDatumRefIter.h>
#include <VizBridge/contracts/tarvex/TarvexPMIDatumRefModifiedDatumIter.h>
#include <VizBridge/semantic/PMIVocabulary.h>
#include <VizBridge/semantic/SemanticFormat.h>

#include <vector>

namespace VizBridgeTarvex {

namespace {

/// The ids of all datums of all references of `frame`, in iterator order, joined by ", ".
WString datumIds(TarvexPMIGDTRefFrame const& frame) {
    std::vector<WString> ids;
    TarvexPMIDatumRefIter references = frame.GetDatumRefIterator();
    while (references.Next()) {
        TarvexPMIDatumRefModifiedDatumIter datums = references.Current().GetModifiedDatumIterator();
        while (datums.Next()) {
            ids.push_back(ToWString(datums.Current().datum.GetID()));
        }
    }
    return JoinStrings(std::move(ids), u", ");
}

} // namespace

void VizGDTSemanticPMILoader::LoadSemantics() {
    VizAnnotationPMILoader::LoadSemantics();
    auto const& tolerance = object<TarvexPMIGDT>();
    loadMainLine(tolerance);
    bool const composite = tolerance.IsComposite();
    write(u"IsComposite", FormatBool(composite));
    if (composite) {
        loadCompositeLine(tolerance);
    }
}

void VizGDTSemanticPMILoader::loadMainLine(TarvexPMIGDT const& tolerance) {
    TarvexPMIToleranceType type = TarvexPMI_TOLTYPE_UNKNOWN;
    TarvexPMIToleranceValueType valueType = TarvexPMI_ValueType_None;
    double values[6] = {0, 0, 0, 0, 0, 0};
    bool allAround = false;
    TarvexWString note(u"");
    tolerance.GetToleranceInfo(type, valueType, values[0], values[1], values[2], values[3],
                               values[4], values[5], allAround, note);
    write(u"TolNote", ToWString(note));
    write(u"Tolerance Type", ToleranceTypeToText(type));
    write(u"Value Type", ToleranceValueTypeToText(valueType));
    char16_t const* const valueKeys[6] = {u"Tolerance Value", u"RefineTolerance",   u"RateUnit1",
                                          u"RateUnit2",       u"ProjTolZoneLength", u"ShiftValue"};
    for (int index = 0; index < 6; ++index) {
        write(valueKeys[index], FormatDouble(values[index]));
    }
    write(u"AllAround", FormatBool(allAround));

    TarvexPMIToleranceModifier first = TarvexPMI_NoModifier;
    TarvexPMIToleranceModifier second = TarvexPMI_NoModifier;
    tolerance.GetModifiers(first, second);
    write(u"Modifier1", ToleranceModifierToText(first));
    write(u"Modifier2", ToleranceModifierToText(second));

    TarvexPMIGDTRefFrame const frame = tolerance.GetRefFrame();
    write(u"refFrameLabel", ToWString(frame.GetLabel()));
    write(u"DatumRefDatas", datumIds(frame));
}

void VizGDTSemanticPMILoader::loadCompositeLine(TarvexPMIGDT const& tolerance) {
    TarvexPMIToleranceValueType valueType = TarvexPMI_ValueType_None;
    double value = 0;
    double rateUnit1 = 0;
    double rateUnit2 = 0;
    tolerance.GetCompositeToleranceInfo(valueType, value, rateUnit1, rateUnit2);
    write(u"Composite_TolType", ToleranceValueTypeToText(valueType));
    write(u"Composite_TolValue", FormatDouble(value));
    write(u"Composite_RateUnit1", FormatDouble(rateUnit1));
    write(u"Composite_RateUnit2", FormatDouble(rateUnit2));

    TarvexPMIToleranceModifier modifier = TarvexPMI_NoModifier;
    tolerance.GetCompositeModifier(modifier);
    write(u"Composite_ToleranceModifier", ToleranceModifierToText(modifier));

    TarvexPMIGDTRefFrame const frame = tolerance.GetCompositeRefFrame();
    write(u"Composite_RefFrameLabel", ToWString(frame.GetLabel()));
    write(u"Composite_DatumRefDatas", datumIds(frame));
}

} // namespace VizBridgeTarvex
