#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPMITypes.h>

#include <array>
#include <memory>
#include <optional>
#include <vector>

// The PMI objects as a host or test describes them. Each class's value object reads its own
// record; the records of objects that others hold (the annotations of a view, the targets of
// a datum, the datums of a reference frame) are shared, so that one object can stand in
// several places and stay one object.

/// A text of a PMI object: absent, the object hands out a text whose pointer is null.
using TarvexAuthoredText = std::optional<VizPort::WString>;

using TarvexAuthoredFloat2 = std::array<float, 2>;
using TarvexAuthoredFloat3 = std::array<float, 3>;

/// What every PMI object has. Polymorphic, so that a list of annotations can hand out each
/// as the class its record was made for.
struct TarvexAuthoredPMIObject {
    virtual ~TarvexAuthoredPMIObject() = default;

    TarvexAuthoredText name;
    TarvexAuthoredText id;
    bool hidden = false;
};

struct TarvexAuthoredPMIPositioning {
    TarvexAuthoredFloat2 position{};
    TarvexPMIOrientation orientation = TarvexPMI_Horizontal;
    float angle = 0;
    float zDepth = 0;
};

struct TarvexAuthoredPMILeader {
    std::vector<TarvexAuthoredFloat2> points;
};

struct TarvexAuthoredPMIAnnotation : TarvexAuthoredPMIObject {
    /// The class a plain annotation reports. Only a class without an object of its own
    /// (0, or a number above 8) is reported as authored: classes 1 to 8 come from their own
    /// records below. A note reports 3, 4 or 5 from here (3 for any other number).
    TarvexPMIAnnotationType objectType = TarvexPMI_UnknownType;
    std::optional<TarvexAuthoredPMIPositioning> positioning; ///< absent: not placed
    std::vector<TarvexAuthoredPMILeader> leaders;
    std::vector<TarvexAuthoredEntity> linkedElements;
};

struct TarvexAuthoredPMINoteText {
    TarvexAuthoredText text;
    TarvexAuthoredText fontName;
    TarvexPMIFont font = TarvexPMI_Simplex;
    bool fixedPitch = false;
    float height = 0;
    bool bold = false;
    bool italic = false;
    bool underline = false;
    bool strikeThrough = false;
    bool overline = false;
    float ratio = 1;
    float slant = 0;
    std::array<double, 4> color{0, 0, 0, 1}; ///< red, green, blue, alpha
};

struct TarvexAuthoredPMINote : TarvexAuthoredPMIAnnotation {
    TarvexAuthoredPMINote() { objectType = TarvexPMI_Note; }
    std::vector<TarvexAuthoredPMINoteText> texts;
    bool flagNote = false;
};

struct TarvexAuthoredPMIDatumTarget : TarvexAuthoredPMIAnnotation {
    TarvexAuthoredText label;
    TarvexPMIDatumTargetType targetType = TarvexPMI_DTT_Unknown;
    bool hasDiameter = false;
    TarvexAuthoredText upper;
    TarvexAuthoredText lower;
    TarvexAuthoredFloat3 position1{};
    TarvexAuthoredFloat3 position2{};
};

struct TarvexAuthoredPMIDatum : TarvexAuthoredPMIAnnotation {
    TarvexAuthoredText label;
    std::vector<std::shared_ptr<TarvexAuthoredPMIDatumTarget const>> targets;
};

struct TarvexAuthoredPMIDimensionTexts {
    TarvexAuthoredText prefix;
    TarvexAuthoredText suffix;
    TarvexAuthoredText before;
    TarvexAuthoredText after;
    TarvexAuthoredText upper;
    TarvexAuthoredText lower;
};

struct TarvexAuthoredPMIDimension : TarvexAuthoredPMIAnnotation {
    TarvexPMIDimensionMainType mainType = TarvexPMI_DMT_Unknown;
    TarvexPMIDimensionSubType subType = TarvexPMI_Distance;
    std::array<double, 3> coordinate{};
    double value = 0;
    TarvexPMIUnit unit = TarvexPMI_DimUnitNone;
    double precision = 0;
    std::optional<std::array<double, 2>> numericalTolerances;                  ///< upper, lower
    std::optional<std::array<TarvexAuthoredText, 2>> alphanumericalTolerances; ///< upper, lower
    std::optional<TarvexAuthoredPMIDimensionTexts> texts;
    std::optional<double> fakeValue;
    std::optional<TarvexAuthoredText> fakeString;
    bool driving = false;
    TarvexAuthoredFloat2 lineStart{};
    TarvexAuthoredFloat2 lineEnd{};
    TarvexPMIArrowSymbol symbolStart = TarvexPMI_NOTUSED;
    TarvexPMIArrowSymbol symbolEnd = TarvexPMI_NOTUSED;
    bool reversed = false;
};

/// A datum as a reference of a frame uses it, with the material condition it is taken at.
struct TarvexAuthoredPMIModifiedDatum {
    std::shared_ptr<TarvexAuthoredPMIDatum const> datum;
    TarvexPMIToleranceModifier modifier = TarvexPMI_NoModifier;
};

struct TarvexAuthoredPMIDatumRef {
    std::vector<TarvexAuthoredPMIModifiedDatum> datums;
};

struct TarvexAuthoredPMIRefFrame {
    TarvexAuthoredText label;
    std::vector<TarvexAuthoredPMIDatumRef> references;
};

/// The second line of a composite tolerance.
struct TarvexAuthoredPMICompositeTolerance {
    TarvexPMIToleranceValueType valueType = TarvexPMI_ValueType_None;
    double value = 0;
    double rateUnit1 = 0;
    double rateUnit2 = 0;
    TarvexPMIToleranceModifier modifier = TarvexPMI_NoModifier;
    TarvexAuthoredPMIRefFrame refFrame;
};

struct TarvexAuthoredPMIGDT : TarvexAuthoredPMIAnnotation {
    TarvexPMIToleranceType toleranceType = TarvexPMI_TOLTYPE_UNKNOWN;
    TarvexPMIToleranceValueType valueType = TarvexPMI_ValueType_None;
    double value = 0;
    double refinement = 0;
    double rateUnit1 = 0;
    double rateUnit2 = 0;
    double projectedZoneLength = 0;
    double shift = 0;
    bool allAround = false;
    TarvexAuthoredText note;
    TarvexPMIToleranceModifier modifier1 = TarvexPMI_NoModifier;
    TarvexPMIToleranceModifier modifier2 = TarvexPMI_NoModifier;
    TarvexAuthoredPMIRefFrame refFrame;
    std::optional<TarvexAuthoredPMICompositeTolerance> composite; ///< absent: not composite
};

struct TarvexAuthoredPMIRoughness : TarvexAuthoredPMIAnnotation {
    TarvexPMIRoughnessObtentionType obtention = TarvexPMI_RO_NotDefined;
    TarvexPMIRoughnessApplicabilityType applicability = TarvexPMI_RA_SpecifiedSurfaceOnly;
    std::vector<TarvexAuthoredText> fields;
};

/// Origin, first direction, second direction of a view's plane.
struct TarvexAuthoredPMIAxis {
    TarvexAuthoredFloat3 origin{};
    TarvexAuthoredFloat3 uDirection{1, 0, 0};
    TarvexAuthoredFloat3 vDirection{0, 1, 0};
};

struct TarvexAuthoredPMIAnnotationView : TarvexAuthoredPMIObject {
    std::optional<TarvexAuthoredPMIAxis> axis; ///< absent: the view has no plane
    std::vector<std::shared_ptr<TarvexAuthoredPMIAnnotation const>> annotations;
};

struct TarvexAuthoredPMICamera {
    TarvexAuthoredText name;
    TarvexPMICameraType type = TarvexPMI_Camera_Unknown;
    TarvexAuthoredFloat3 position{};
    TarvexAuthoredFloat3 target{};
    TarvexAuthoredFloat3 upDirection{0, 0, 1};
    float angle = 0;
    float zoom = 1;
};

struct TarvexAuthoredPMIClippingPlane {
    TarvexAuthoredFloat3 origin{};
    TarvexAuthoredFloat3 normal{0, 0, 1};
};

struct TarvexAuthoredPMICapture : TarvexAuthoredPMIObject {
    /// What the capture's own attributes say of hiding, which need not agree with `hidden`.
    bool attributesHidden = false;
    bool current = false;
    TarvexAuthoredText hiddenText;
    TarvexAuthoredPMICamera camera;
    std::optional<TarvexAuthoredPMIClippingPlane> clippingPlane;
    std::vector<std::shared_ptr<TarvexAuthoredPMIAnnotation const>> annotations;
    bool managesBodies = false;
    std::vector<TarvexAuthoredEntity> bodies;
};
