#include "SamplePMI.h"

#include <string>
#include <vector>

namespace VizBridgeExamples {

namespace {

using VizPort::WString;

/// Faces of the Bracket's box in the order of its BREP.
enum BracketFace { Bottom, Top, Front, Back, Right, Left };

template <class Record>
std::shared_ptr<Record> Object(char16_t const* name, char16_t const* id,
                               std::vector<unsigned int> const& faces) {
    auto record = std::make_shared<Record>();
    record->name = name;
    record->id = WString(u"PMI:Bracket.") + id;
    for (unsigned int face : faces) {
        record->linkedElements.push_back(TarvexAuthoredEntity{{}, face, std::nullopt, true});
    }
    return record;
}

/// Placed in the front view's plane at `x`, `y`, with one leader from there to `to`.
void Place(TarvexAuthoredPMIAnnotation& annotation, float x, float y, TarvexAuthoredFloat2 to) {
    annotation.positioning = TarvexAuthoredPMIPositioning{{x, y}, TarvexPMI_Horizontal, 0, 0};
    annotation.leaders = {TarvexAuthoredPMILeader{{{x, y}, to}}};
}

std::shared_ptr<TarvexAuthoredPMIDatum> Datum(char16_t const* label, unsigned int face) {
    auto datum =
        Object<TarvexAuthoredPMIDatum>(u"Datum", (WString(u"Datum") + label).c_str(), {face});
    datum->label = label;
    return datum;
}

TarvexAuthoredPMIRefFrame
Frame(std::vector<std::shared_ptr<TarvexAuthoredPMIDatum>> const& datums) {
    TarvexAuthoredPMIRefFrame frame;
    frame.label = WString();
    for (auto const& datum : datums) {
        if (!frame.references.empty()) {
            *frame.label += u'|';
        }
        *frame.label += *datum->label;
        frame.references.push_back({{{datum, TarvexPMI_NoModifier}}});
    }
    return frame;
}

} // namespace

SamplePMI SamplePMI::Bracket(unsigned int firstFaceId) {
    auto face = [firstFaceId](BracketFace which) { return firstFaceId + which; };

    auto length =
        Object<TarvexAuthoredPMIDimension>(u"Length 60", u"PMI1", {face(Left), face(Right)});
    Place(*length, 27, 21, {0, 20});
    length->mainType = TarvexPMI_DMT_Tolerance;
    length->subType = TarvexPMI_Distance;
    length->value = 60;
    length->unit = TarvexPMI_DimUnitMM;
    length->precision = 0.1;
    length->numericalTolerances = {{0.1, -0.1}};
    length->driving = true;
    length->lineStart = {0, 20};
    length->lineEnd = {60, 20};
    length->symbolStart = length->symbolEnd = TarvexPMI_FILLED_ARROW;

    auto note = Object<TarvexAuthoredPMINote>(u"Hole note", u"PMI2", {face(Top)});
    Place(*note, 71, 29, {45, 10});
    TarvexAuthoredPMINoteText text;
    text.text = u"2X M6 THRU";
    text.fontName = u"DejaVu Sans";
    text.font = TarvexPMI_ISO;
    text.height = 3.5f;
    note->texts = {text};

    auto datumA = Datum(u"A", face(Bottom));
    TarvexAuthoredFloat3 const spots[3] = {{10, 5, 0}, {50, 5, 0}, {30, 15, 0}};
    for (char16_t k = 0; k < 3; ++k) {
        WString label(u"A");
        label += static_cast<char16_t>(u'1' + k);
        auto target = Object<TarvexAuthoredPMIDatumTarget>(
            u"Datum target", (WString(u"Datum") + label).c_str(), {face(Bottom)});
        target->label = label;
        target->targetType = TarvexPMI_DTT_Point;
        target->upper = label;
        target->position1 = spots[k];
        datumA->targets.push_back(target);
    }
    auto datumB = Datum(u"B", face(Front));
    auto datumC = Datum(u"C", face(Left));

    auto flatness = Object<TarvexAuthoredPMIGDT>(u"Flatness", u"PMI3", {face(Bottom)});
    flatness->hidden = true;
    Place(*flatness, 12, -10.5f, {20, 0});
    flatness->toleranceType = TarvexPMI_Form_Flatness;
    flatness->value = 0.05;

    auto diameter = Object<TarvexAuthoredPMIDimension>(u"Hole diameter", u"PMI4", {face(Top)});
    Place(*diameter, 20, 28, {15, 10});
    diameter->mainType = TarvexPMI_DMT_Tolerance;
    diameter->subType = TarvexPMI_DiameterCylinder;
    diameter->value = 6.4;
    diameter->unit = TarvexPMI_DimUnitMM;
    diameter->precision = 0.1;
    diameter->numericalTolerances = {{0.1, 0}};
    diameter->texts = TarvexAuthoredPMIDimensionTexts{u"2X ", u"", u"", u"THRU", u"", u""};
    diameter->lineStart = {12.8f, 10};
    diameter->lineEnd = {17.2f, 10};
    diameter->symbolStart = diameter->symbolEnd = TarvexPMI_FILLED_ARROW;

    auto position = Object<TarvexAuthoredPMIGDT>(u"Hole position", u"PMI5", {face(Top)});
    Place(*position, 40, 32, {45, 10});
    position->toleranceType = TarvexPMI_Location_TruePosition;
    position->valueType = TarvexPMI_ValueType_Diameter;
    position->value = 0.2;
    position->note = u"2X";
    position->modifier1 = TarvexPMI_MaterialCondition_Maximum;
    position->refFrame = Frame({datumA, datumB, datumC});
    position->composite = TarvexAuthoredPMICompositeTolerance{
        TarvexPMI_ValueType_Diameter,        0.05,           0, 0,
        TarvexPMI_MaterialCondition_Maximum, Frame({datumA})};

    auto roughness = Object<TarvexAuthoredPMIRoughness>(u"Roughness", u"PMI6", {face(Top)});
    Place(*roughness, 50, 24, {50, 10});
    roughness->obtention = TarvexPMI_RO_MachiningMandatory;
    roughness->applicability = TarvexPMI_RA_SpecifiedSurfaceOnly;
    roughness->fields = {u"Ra 1.6", u"", u"milled"};

    SamplePMI sample;
    sample.front = std::make_shared<TarvexAuthoredPMIAnnotationView>();
    sample.front->name = u"Front";
    sample.front->id = u"PMI:Bracket.View1";
    sample.front->axis = TarvexAuthoredPMIAxis{{0, 0, 0}, {1, 0, 0}, {0, 0, 1}};
    sample.front->annotations = {length, note,   flatness, diameter, position,
                                 datumA, datumB, datumC,   roughness};

    sample.inspection = std::make_shared<TarvexAuthoredPMICapture>();
    sample.inspection->name = u"Inspection";
    sample.inspection->id = u"PMI:Bracket.Capture1";
    sample.inspection->current = true;
    sample.inspection->camera = {u"Inspection camera",
                                 TarvexPMI_Camera_Perspective,
                                 {30, -120, 60},
                                 {30, 10, 5},
                                 {0, 0, 1},
                                 0.7f,
                                 1};
    sample.inspection->annotations = {length, flatness};
    sample.inspection->managesBodies = true;
    sample.inspection->bodies = {TarvexAuthoredEntity{{}, firstFaceId, std::nullopt, true}};
    return sample;
}

} // namespace VizBridgeExamples
