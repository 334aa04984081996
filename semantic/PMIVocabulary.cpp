#include <VizBridge/semantic/PMIVocabulary.h>

#include <VizBridge/contracts/kolba/AllowThrow.h>

#include <cstddef>
#include <iterator>
#include <stdexcept>

namespace VizBridgeTarvex {

namespace {

/// One enumeration's names by value, its default text and its error text.
struct Vocabulary {
    char16_t const* const* names;
    int count;
    char16_t const* defaultText;
    char const* error;
};

template <std::size_t N>
constexpr Vocabulary vocabulary(char16_t const* const (&names)[N], char16_t const* defaultText,
                                char const* error) {
    return {names, static_cast<int>(N), defaultText, error};
}

VizPort::WString nameOf(Vocabulary const& vocabulary, int value) {
    if (value >= 0 && value < vocabulary.count) {
        return vocabulary.names[value];
    }
    if (KolbaVizCore::GetAllowThrow()) {
        throw std::runtime_error(vocabulary.error);
    }
    return vocabulary.defaultText;
}

char16_t const* const kOrientationNames[] = {u"TarvexPMI_Horizontal", u"TarvexPMI_Vertical",
                                             u"TarvexPMI_Parallel", u"TarvexPMI_Perpendicular",
                                             u"TarvexPMI_DimAngle"};
char16_t const* const kCameraTypeNames[] = {
    u"TarvexPMI_Camera_Unknown", u"TarvexPMI_Camera_Perspective", u"TarvexPMI_Camera_Orthographic"};
char16_t const* const kDatumTargetTypeNames[] = {
    u"TarvexPMI_DTT_Unknown",      u"TarvexPMI_DTT_Point",           u"TarvexPMI_DTT_Line",
    u"TarvexPMI_DTT_AreaCircular", u"TarvexPMI_DTT_AreaRectangular", u"TarvexPMI_DTT_AreaFace",
    u"TarvexPMI_DTT_Feature",      u"TarvexPMI_DTT_UserDefined"};
char16_t const* const kDimensionMainTypeNames[] = {
    u"TarvexPMI_DMT_Unknown", u"TarvexPMI_DMT_Basic", u"TarvexPMI_DMT_Reference",
    u"TarvexPMI_DMT_Tolerance", u"TarvexPMI_DMT_CoordDim"};
char16_t const* const kDimensionSubTypeNames[] = {u"TarvexPMI_Distance",
                                                  u"TarvexPMI_DistanceOffset",
                                                  u"TarvexPMI_Length",
                                                  u"TarvexPMI_Length_OR_Distance",
                                                  u"TarvexPMI_LengthCurvilinear",
                                                  u"TarvexPMI_Angle",
                                                  u"TarvexPMI_Radius",
                                                  u"TarvexPMI_RadiusTangent",
                                                  u"TarvexPMI_RadiusCylinder",
                                                  u"TarvexPMI_RadiusEdge",
                                                  u"TarvexPMI_Diameter",
                                                  u"TarvexPMI_DiameterTangent",
                                                  u"TarvexPMI_DiameterCylinder",
                                                  u"TarvexPMI_DiameterEdge",
                                                  u"TarvexPMI_DiameterCone",
                                                  u"TarvexPMI_Chamfer",
                                                  u"TarvexPMI_Slope",
                                                  u"TarvexPMI_DimGDT",
                                                  u"TarvexPMI_DimDatumFeature",
                                                  u"TarvexPMI_DimDatumTarget",
                                                  u"TarvexPMI_DimBalloon",
                                                  u"TarvexPMI_No_Dim",
                                                  u"TarvexPMI_AngleArc",
                                                  u"TarvexPMI_LengthCircular",
                                                  u"TarvexPMI_Fillet",
                                                  u"TarvexPMI_CoordDimension_2D",
                                                  u"TarvexPMI_CoordDimension_3D"};
char16_t const* const kUnitNames[] = {
    u"TarvexPMI_DimUnitNone",    u"TarvexPMI_DimUnitMM",      u"TarvexPMI_DimUnitINCH",
    u"TarvexPMI_DimUnitMETER",   u"TarvexPMI_DimUnitCM",      u"TarvexPMI_DimUnitKM",
    u"TarvexPMI_DimUnitFOOT",    u"TarvexPMI_DimUnitF_I_F64", u"TarvexPMI_DimUnitF_I_F16",
    u"TarvexPMI_DimUnitF_I_DEC", u"TarvexPMI_DimUnitDEGREE",  u"TarvexPMI_DimUnitMINUTE",
    u"TarvexPMI_DimUnitSECOND",  u"TarvexPMI_DimUnitRADIAN"};
char16_t const* const kArrowSymbolNames[] = {u"TarvexPMI_NOTUSED",
                                             u"TarvexPMI_CROSS",
                                             u"TarvexPMI_PLUS",
                                             u"TarvexPMI_CONCENTRIC",
                                             u"TarvexPMI_COINCIDENT",
                                             u"TarvexPMI_FULLCIRCLE",
                                             u"TarvexPMI_FULLSQUARE",
                                             u"TarvexPMI_STAR",
                                             u"TarvexPMI_DOT",
                                             u"TarvexPMI_SMALLDOT",
                                             u"TarvexPMI_MISC1",
                                             u"TarvexPMI_MISC2",
                                             u"TarvexPMI_FULLCIRCLE2",
                                             u"TarvexPMI_FULLSQUARE2",
                                             u"TarvexPMI_OPEN_ARROW",
                                             u"TarvexPMI_UNFILLED_ARROW",
                                             u"TarvexPMI_BLANKED_ARROW",
                                             u"TarvexPMI_FILLED_ARROW",
                                             u"TarvexPMI_UNFILLED_CIRCLE",
                                             u"TarvexPMI_BLANKED_CIRCLE",
                                             u"TarvexPMI_FILLED_CIRCLE",
                                             u"TarvexPMI_CROSSED_CIRCLE",
                                             u"TarvexPMI_BLANKED_SQUARE",
                                             u"TarvexPMI_FILLED_SQUARE",
                                             u"TarvexPMI_BLANKED_TRIANGLE",
                                             u"TarvexPMI_FILLED_TRIANGLE",
                                             u"TarvexPMI_MANIPULATOR_SQUARE",
                                             u"TarvexPMI_MANIPULATOR_DIAMOND",
                                             u"TarvexPMI_MANIPULATOR_CIRCLE",
                                             u"TarvexPMI_MANIPULATOR_TRIANGLE",
                                             u"TarvexPMI_DOUBLE_OPEN_ARROW",
                                             u"TarvexPMI_WAVE"};
char16_t const* const kToleranceTypeNames[] = {u"TarvexPMI_TOLTYPE_UNKNOWN",
                                               u"TarvexPMI_Form_Straightness",
                                               u"TarvexPMI_Form_Flatness",
                                               u"TarvexPMI_Form_Circularity",
                                               u"TarvexPMI_Form_Cylindricity",
                                               u"TarvexPMI_Form_ProfileAnyLine",
                                               u"TarvexPMI_Form_ProfileAnySurface",
                                               u"TarvexPMI_Orientation_Parallelism",
                                               u"TarvexPMI_Orientation_Perpendicularity",
                                               u"TarvexPMI_Orientation_Angularity",
                                               u"TarvexPMI_Location_TruePosition",
                                               u"TarvexPMI_Location_Concentricity",
                                               u"TarvexPMI_Location_Coaxiality",
                                               u"TarvexPMI_Location_Symmetry",
                                               u"TarvexPMI_Location_PositionOfAnyLine",
                                               u"TarvexPMI_Location_PositionOfASurface",
                                               u"TarvexPMI_RunOut_Circular",
                                               u"TarvexPMI_RunOut_Total"};
char16_t const* const kToleranceValueTypeNames[] = {
    u"TarvexPMI_ValueType_None", u"TarvexPMI_ValueType_Diameter", u"TarvexPMI_ValueType_Radius",
    u"TarvexPMI_ValueType_Spherical", u"TarvexPMI_ValueType_Square"};
char16_t const* const kToleranceModifierNames[] = {
    u"TarvexPMI_NoModifier",
    u"TarvexPMI_MaterialCondition_Unsupported",
    u"TarvexPMI_MaterialCondition_NoModifier",
    u"TarvexPMI_MaterialCondition_Maximum",
    u"TarvexPMI_MaterialCondition_Least",
    u"TarvexPMI_MaterialCondition_RegardlessOfFeatureSize",
    u"TarvexPMI_TangentPlane_Unsupported",
    u"TarvexPMI_TangentPlane_NotTangent",
    u"TarvexPMI_TangentPlane_Tangent",
    u"TarvexPMI_FreeState_Unsupported",
    u"TarvexPMI_FreeState_Free",
    u"TarvexPMI_FreeState_NotFree",
    u"TarvexPMI_Statistical_Symbol"};
char16_t const* const kFontNames[] = {
    u"TarvexPMI_Simplex",   u"TarvexPMI_Din",       u"TarvexPMI_Military",
    u"TarvexPMI_ISO",       u"TarvexPMI_Lightline", u"TarvexPMI_Century",
    u"TarvexPMI_IGES_1001", u"TarvexPMI_IGES_1002", u"TarvexPMI_IGES_1003"};
char16_t const* const kRoughnessObtentionTypeNames[] = {
    u"TarvexPMI_RO_UnSupported", u"TarvexPMI_RO_NotDefined", u"TarvexPMI_RO_MachiningMandatory",
    u"TarvexPMI_RO_MachiningForbidden"};
char16_t const* const kRoughnessApplicabilityTypeNames[] = {
    u"TarvexPMI_RA_UnSupported", u"TarvexPMI_RA_SpecifiedSurfaceOnly",
    u"TarvexPMI_RA_AllPartSurfaces", u"TarvexPMI_RA_BasicSurface"};

char16_t const* const kAnnotationTypeNames[] = {
    u"TarvexPMI_UnknownType", u"TarvexPMI_Datum",    u"TarvexPMI_DatumTarget",
    u"TarvexPMI_Note",        u"TarvexPMI_FlagNote", u"TarvexPMI_NOA",
    u"TarvexPMI_Roughness",   u"TarvexPMI_GDT",      u"TarvexPMI_Dimension"};

} // namespace

VizPort::WString OrientationToText(TarvexPMIOrientation value) {
    static constexpr Vocabulary names =
        vocabulary(kOrientationNames, u"TarvexPMI_Unknown", "Unknown type of TarvexPMIOrientation");
    return nameOf(names, value);
}

VizPort::WString CameraTypeToText(TarvexPMICameraType value) {
    static constexpr Vocabulary names = vocabulary(kCameraTypeNames, u"TarvexPMI_Camera_Unknown",
                                                   "Unknown type of TarvexPMICameraType");
    return nameOf(names, value);
}

VizPort::WString DatumTargetTypeToText(TarvexPMIDatumTargetType value) {
    static constexpr Vocabulary names = vocabulary(kDatumTargetTypeNames, u"TarvexPMI_DTT_Unknown",
                                                   "Unknown type of TarvexPMIDatumTargetType");
    return nameOf(names, value);
}

VizPort::WString DimensionMainTypeToText(TarvexPMIDimensionMainType value) {
    static constexpr Vocabulary names =
        vocabulary(kDimensionMainTypeNames, u"TarvexPMI_DMT_Unknown",
                   "Unknown type of TarvexPMIDimensionMainType");
    return nameOf(names, value);
}

VizPort::WString DimensionSubTypeToText(TarvexPMIDimensionSubType value) {
    static constexpr Vocabulary names = vocabulary(kDimensionSubTypeNames, u"TarvexPMI_Unknown",
                                                   "Unknown type of TarvexPMIDimensionSubType");
    return nameOf(names, value);
}

VizPort::WString UnitToText(TarvexPMIUnit value) {
    static constexpr Vocabulary names =
        vocabulary(kUnitNames, u"TarvexPMI_DimUnitNone", "Unknown type of TarvexPMIUnit");
    return nameOf(names, value);
}

VizPort::WString ArrowSymbolToText(TarvexPMIArrowSymbol value) {
    static constexpr Vocabulary names =
        vocabulary(kArrowSymbolNames, u"TarvexPMI_NOTUSED", "Unknown type of TarvexPMIArrowSymbol");
    return nameOf(names, value);
}

VizPort::WString ToleranceTypeToText(TarvexPMIToleranceType value) {
    static constexpr Vocabulary names =
        vocabulary(kToleranceTypeNames, u"TarvexPMI_TOLTYPE_UNKNOWN",
                   "Unknown type of TarvexPMIToleranceType");
    return nameOf(names, value);
}

VizPort::WString ToleranceValueTypeToText(TarvexPMIToleranceValueType value) {
    static constexpr Vocabulary names =
        vocabulary(kToleranceValueTypeNames, u"TarvexPMI_ValueType_None",
                   "Unknown type of TarvexPMIToleranceValueType");
    return nameOf(names, value);
}

VizPort::WString ToleranceModifierToText(TarvexPMIToleranceModifier value) {
    static constexpr Vocabulary names = vocabulary(kToleranceModifierNames, u"TarvexPMI_NoModifier",
                                                   "Unknown type of TarvexPMIToleranceModifier");
    return nameOf(names, value);
}

VizPort::WString FontToText(TarvexPMIFont value) {
    static constexpr Vocabulary names =
        vocabulary(kFontNames, u"TarvexPMI_Unknown", "Unknown type of TarvexPMIFont");
    return nameOf(names, value);
}

VizPort::WString RoughnessObtentionTypeToText(TarvexPMIRoughnessObtentionType value) {
    static constexpr Vocabulary names =
        vocabulary(kRoughnessObtentionTypeNames, u"TarvexPMI_Unknown",
                   "Unknown type of TarvexPMIRoughnessObtentionType");
    return nameOf(names, value);
}

VizPort::WString RoughnessApplicabilityTypeToText(TarvexPMIRoughnessApplicabilityType value) {
    static constexpr Vocabulary names =
        vocabulary(kRoughnessApplicabilityTypeNames, u"TarvexPMI_Unknown",
                   "Unknown type of TarvexPMIRoughnessApplicabilityType");
    return nameOf(names, value);
}

VizPort::WString AnnotationTypeToText(int value) {
    constexpr int count = static_cast<int>(std::size(kAnnotationTypeNames));
    return kAnnotationTypeNames[value >= 0 && value < count ? value : 0];
}

} // namespace VizBridgeTarvex
