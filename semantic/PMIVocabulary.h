#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexPMITypes.h>

// The names under which the values of the import library's PMI enumerations reach a semantic
// record: the text a user finally reads. A value outside its enumeration's names throws a
// std::runtime_error "Unknown type of <enumeration>" under the throw switch, and otherwise gives
// the function's default text (the text of value 0 in most of them, "TarvexPMI_Unknown" where
// no value has it).

namespace VizBridgeTarvex {

VizPort::WString OrientationToText(TarvexPMIOrientation value);
VizPort::WString CameraTypeToText(TarvexPMICameraType value);
VizPort::WString DatumTargetTypeToText(TarvexPMIDatumTargetType value);
VizPort::WString DimensionMainTypeToText(TarvexPMIDimensionMainType value);
VizPort::WString DimensionSubTypeToText(TarvexPMIDimensionSubType value);
VizPort::WString UnitToText(TarvexPMIUnit value);
VizPort::WString ArrowSymbolToText(TarvexPMIArrowSymbol value);
VizPort::WString ToleranceTypeToText(TarvexPMIToleranceType value);
VizPort::WString ToleranceValueTypeToText(TarvexPMIToleranceValueType value);
VizPort::WString ToleranceModifierToText(TarvexPMIToleranceModifier value);
VizPort::WString FontToText(TarvexPMIFont value);
VizPort::WString RoughnessObtentionTypeToText(TarvexPMIRoughnessObtentionType value);
VizPort::WString RoughnessApplicabilityTypeToText(TarvexPMIRoughnessApplicabilityType value);

/// The name of an annotation class as GetObjectType reports it. A value outside 0 to 8 names
/// no class and gives the name of 0, "TarvexPMI_UnknownType"; it never throws.
VizPort::WString AnnotationTypeToText(int value);

} // namespace VizBridgeTarvex
