#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/semantic/VizCapturePMILoader.h>
#include <VizBridge/semantic/VizDatumSemanticPMILoader.h>
#include <VizBridge/semantic/VizDatumTargetSemanticPMILoader.h>
#include <VizBridge/semantic/VizDimensionSemanticPMILoader.h>
#include <VizBridge/semantic/VizGDTSemanticPMILoader.h>
#include <VizBridge/semantic/VizNoteSemanticPMILoader.h>
#include <VizBridge/semantic/VizRoughnessSemanticPMILoader.h>
#include <VizBridge/semantic/VizViewSemanticPMILoader.h>

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>

using namespace VizBridgeTarvex;

namespace {

/// The record as a reader sees it, one "key : value" line each, narrowed for readable diffs.
std::string text(SemanticPMI const& record) {
    return VizPort::Narrow(record.ToString());
}

/// Runs one loader of class `Loader` on a fresh record and gives the record's text.
template <class Loader, class Object, class... Extra>
std::string load(Object object, Extra... extra) {
    SemanticPMI record;
    Loader(object, record, extra...).Load();
    return text(record);
}

template <class Record> Record named(char16_t const* name, char16_t const* id) {
    Record record;
    record.name = name;
    record.id = id;
    return record;
}

TarvexAuthoredPMIRefFrame frame(char16_t const* label,
                                std::vector<std::vector<char16_t const*>> const& references) {
    TarvexAuthoredPMIRefFrame result;
    result.label = label;
    for (auto const& datums : references) {
        TarvexAuthoredPMIDatumRef reference;
        for (char16_t const* id : datums) {
            auto datum = std::make_shared<TarvexAuthoredPMIDatum>(
                named<TarvexAuthoredPMIDatum>(u"Datum", id));
            reference.datums.push_back({datum, TarvexPMI_MaterialCondition_Maximum});
        }
        result.references.push_back(reference);
    }
    return result;
}

TarvexAuthoredPMIDimension diameter() {
    auto record = named<TarvexAuthoredPMIDimension>(u"Diameter 1", u"DIM-7");
    record.positioning = TarvexAuthoredPMIPositioning{{12.5f, -3}, TarvexPMI_Parallel, 90, 0.25f};
    record.leaders = {{{{1, 2}, {3, 4}}}, {{{5, 6}}}, {}};
    record.mainType = TarvexPMI_DMT_Tolerance;
    record.subType = TarvexPMI_Diameter;
    record.coordinate = {1, 2, 3};
    record.value = 10;
    record.unit = TarvexPMI_DimUnitMM;
    record.precision = 0.01;
    record.numericalTolerances = {{0.1, -0.05}};
    record.alphanumericalTolerances = {{u"H7", std::nullopt}};
    record.texts = TarvexAuthoredPMIDimensionTexts{u"2X ", u"", u"", u"", u"", u""};
    record.fakeValue = 10.02;
    record.driving = true;
    record.lineStart = {0, 0};
    record.lineEnd = {10, 0};
    record.symbolStart = TarvexPMI_FILLED_ARROW;
    record.symbolEnd = TarvexPMI_OPEN_ARROW;
    return record;
}

} // namespace

TEST(SemanticLoader, DimensionWritesEveryPieceAndLeavesOutWhatItDoesNotHold) {
    TarvexModel model;
    EXPECT_EQ(
        load<VizDimensionSemanticPMILoader>(model.MakePMIObject<TarvexPMIDimension>(diameter())),
        "Name : Diameter 1\nLabel : \nID : DIM-7\n"
        "After : \nAngle : 90.000000\nBefore : \nCoordinate : (1.000000, 2.000000, 3.000000)\n"
        "DrivingDim : true\nFakeValue : 10.020000\nHidden : false\nIsReversed : false\n"
        "Leader : [ (1.000000, 2.000000), (3.000000, 4.000000) ][ (5.000000, 6.000000) ][  ]\n"
        "LineEnd : (10.000000, 0.000000)\nLineStart : (0.000000, 0.000000)\n"
        "LineSymbolEnd : TarvexPMI_OPEN_ARROW\nLineSymbolStart : TarvexPMI_FILLED_ARROW\n"
        "Lower : \nLowerString : \nLowerVal : -0.050000\nMainType : TarvexPMI_DMT_Tolerance\n"
        "Orientation : TarvexPMI_Parallel\nPosition : (12.500000, -3.000000)\n"
        "Precision : 0.010000\nPrefix : 2X \nSubType : TarvexPMI_Diameter\nSuffix : \n"
        "Unit : TarvexPMI_DimUnitMM\nUpper : \nUpperString : H7\nUpperVal : 0.100000\n"
        "Value : 10.000000\nZ Depth : 0.250000\n");

    // Nothing optional: no placement, leaders, tolerances, texts or substitutes; no name.
    TarvexAuthoredPMIDimension bare;
    bare.value = 4;
    EXPECT_EQ(load<VizDimensionSemanticPMILoader>(model.MakePMIObject<TarvexPMIDimension>(bare)),
              "Name : \nLabel : \nID : \nCoordinate : (0.000000, 0.000000, 0.000000)\n"
              "DrivingDim : false\nHidden : false\nIsReversed : false\n"
              "LineEnd : (0.000000, 0.000000)\nLineStart : (0.000000, 0.000000)\n"
              "LineSymbolEnd : TarvexPMI_NOTUSED\nLineSymbolStart : TarvexPMI_NOTUSED\n"
              "MainType : TarvexPMI_DMT_Unknown\nPrecision : 0.000000\n"
              "SubType : TarvexPMI_Distance\nUnit : TarvexPMI_DimUnitNone\nValue : 4.000000\n");
}

TEST(SemanticLoader, GeometricalToleranceWithCompositeLineAndFlatDatumList) {
    TarvexModel model;
    auto position = named<TarvexAuthoredPMIGDT>(u"Position", u"GDT-3");
    position.toleranceType = TarvexPMI_Location_TruePosition;
    position.valueType = TarvexPMI_ValueType_Diameter;
    position.value = 0.25;
    position.note = u"4X";
    position.modifier1 = TarvexPMI_MaterialCondition_Maximum;
    position.refFrame = frame(u"A|B-C", {{u"D-A"}, {u"D-B", u"D-C"}});
    position.composite = TarvexAuthoredPMICompositeTolerance{
        TarvexPMI_ValueType_Diameter, 0.1, 0, 0, TarvexPMI_MaterialCondition_Least,
        frame(u"A", {{u"D-A"}})};
    EXPECT_EQ(load<VizGDTSemanticPMILoader>(model.MakePMIObject<TarvexPMIGDT>(position)),
              "Name : Position\nLabel : \nID : GDT-3\nAllAround : false\n"
              "Composite_DatumRefDatas : D-A\nComposite_RateUnit1 : 0.000000\n"
              "Composite_RateUnit2 : 0.000000\nComposite_RefFrameLabel : A\n"
              "Composite_TolType : TarvexPMI_ValueType_Diameter\nComposite_TolValue : 0.100000\n"
              "Composite_ToleranceModifier : TarvexPMI_MaterialCondition_Least\n"
              "DatumRefDatas : D-A, D-B, D-C\nHidden : false\nIsComposite : true\n"
              "Modifier1 : TarvexPMI_MaterialCondition_Maximum\nModifier2 : TarvexPMI_NoModifier\n"
              "ProjTolZoneLength : 0.000000\nRateUnit1 : 0.000000\nRateUnit2 : 0.000000\n"
              "RefineTolerance : 0.000000\nShiftValue : 0.000000\nTolNote : 4X\n"
              "Tolerance Type : TarvexPMI_Location_TruePosition\nTolerance Value : 0.250000\n"
              "Value Type : TarvexPMI_ValueType_Diameter\nrefFrameLabel : A|B-C\n");

    // Not composite, a frame without references and without a label text.
    auto flatness = named<TarvexAuthoredPMIGDT>(u"Flatness", u"GDT-4");
    flatness.toleranceType = TarvexPMI_Form_Flatness;
    std::string const flat =
        load<VizGDTSemanticPMILoader>(model.MakePMIObject<TarvexPMIGDT>(flatness));
    EXPECT_NE(flat.find("DatumRefDatas : \nHidden"), std::string::npos) << flat;
    EXPECT_NE(flat.find("IsComposite : false\n"), std::string::npos) << flat;
    EXPECT_NE(flat.find("refFrameLabel : \n"), std::string::npos) << flat;
    EXPECT_EQ(flat.find("Composite_"), std::string::npos) << flat;
}

TEST(SemanticLoader, NotesDatumsTargetsAndRoughness) {
    TarvexModel model;
    auto note = named<TarvexAuthoredPMINote>(u"Note", u"N-1");
    note.hidden = true;
    TarvexAuthoredPMINoteText first;
    first.text = u"FIRST";
    note.texts = {first, TarvexAuthoredPMINoteText{u"BREAK EDGES",
                                                   std::nullopt,
                                                   TarvexPMI_ISO,
                                                   true,
                                                   3.5f,
                                                   true,
                                                   false,
                                                   true,
                                                   false,
                                                   false,
                                                   1,
                                                   0.5f,
                                                   {1, 0, 0.5, 1}}};
    note.flagNote = true;
    EXPECT_EQ(load<VizNoteSemanticPMILoader>(model.MakePMIObject<TarvexPMINote>(note)),
              "Name : Note\nLabel : BREAK EDGES\nID : N-1\nBold : true\nFixedPitch : true\n"
              "Flag Note : true\nFontName : \nFontType : TarvexPMI_ISO\nHeight : 3.500000\n"
              "Hidden : true\nItalic : false\nOverline : false\n"
              "RGBAColor : (1.000000, 0.000000, 0.500000, 1.000000)\nRatio : 1.000000\n"
              "Slant : 0.500000\nStrikeThrough : false\nUnderline : true\n");
    EXPECT_EQ(load<VizNoteSemanticPMILoader>(
                  model.MakePMIObject<TarvexPMINote>(named<TarvexAuthoredPMINote>(u"", u"N-2"))),
              "Name : \nLabel : \nID : N-2\nFlag Note : false\nHidden : false\n");

    auto target = std::make_shared<TarvexAuthoredPMIDatumTarget>(
        named<TarvexAuthoredPMIDatumTarget>(u"Target", u"T-1"));
    target->label = u"A1";
    target->targetType = TarvexPMI_DTT_AreaCircular;
    target->hasDiameter = true;
    target->upper = u"8";
    target->position1 = {1, 2, 3};
    auto datum = named<TarvexAuthoredPMIDatum>(u"Datum A", u"D-A");
    datum.label = u"A";
    datum.targets = {target};
    EXPECT_EQ(load<VizDatumSemanticPMILoader>(model.MakePMIObject<TarvexPMIDatum>(datum)),
              "Name : Datum A\nLabel : A\nID : D-A\nHidden : false\n");
    std::string const targetKeys = "Name : Target\nLabel : A1\nID : T-1\n"
                                   "{}Has_Diameter : true\n{}Lower : \n"
                                   "{}Position 1 : (1.000000, 2.000000, 3.000000)\n"
                                   "{}Position 2 : (0.000000, 0.000000, 0.000000)\n"
                                   "{}Target Type : TarvexPMI_DTT_AreaCircular\n{}Upper : 8\n";
    auto withPrefix = [&targetKeys](std::string const& prefix, bool hiddenFirst) {
        std::string expected = targetKeys;
        for (auto at = expected.find("{}"); at != std::string::npos; at = expected.find("{}"))
            expected.replace(at, 2, prefix);
        // "Hidden" has no prefix: it sorts before the prefixed keys or among the plain ones.
        auto const at = hiddenFirst ? expected.find("_1Has") : expected.find("Lower");
        return expected.insert(at, "Hidden : false\n");
    };
    EXPECT_EQ(load<VizDatumTargetSemanticPMILoader>(
                  model.MakePMIObject<TarvexPMIDatumTarget>(*target), WString(u"_1")),
              withPrefix("_1", true));
    EXPECT_EQ(load<VizDatumTargetSemanticPMILoader>(
                  model.MakePMIObject<TarvexPMIDatumTarget>(*target), WString()),
              withPrefix("", false));

    auto roughness = named<TarvexAuthoredPMIRoughness>(u"Ra", u"R-1");
    roughness.obtention = TarvexPMI_RO_MachiningMandatory;
    roughness.applicability = TarvexPMI_RA_AllPartSurfaces;
    for (int field = 0; field < 11; ++field)
        roughness.fields.push_back(field == 2 ? TarvexAuthoredText()
                                              : VizPort::Widen(std::to_string(field)));
    std::string const rough =
        load<VizRoughnessSemanticPMILoader>(model.MakePMIObject<TarvexPMIRoughness>(roughness));
    EXPECT_NE(rough.find("0_Rough : 0\n10_Rough : 10\n1_Rough : 1\n2_Rough : \n3_Rough : 3\n"),
              std::string::npos)
        << rough;
    EXPECT_NE(rough.find("ApplicabilityType : TarvexPMI_RA_AllPartSurfaces\nCount : 11\n"),
              std::string::npos)
        << rough;
    EXPECT_NE(rough.find("ObtentionType : TarvexPMI_RO_MachiningMandatory\n"), std::string::npos);
    roughness.fields.clear();
    EXPECT_EQ(
        load<VizRoughnessSemanticPMILoader>(model.MakePMIObject<TarvexPMIRoughness>(roughness))
            .find("_Rough"),
        std::string::npos);
}

TEST(SemanticLoader, ViewsAndCapturesHaveNoAnnotationKeys) {
    TarvexModel model;
    auto view = named<TarvexAuthoredPMIAnnotationView>(u"Front", u"V-1");
    EXPECT_EQ(load<VizViewSemanticPMILoader>(model.MakePMIObject<TarvexPMIAnnotationView>(view)),
              "Name : Front\nLabel : \nID : V-1\nHidden : false\n");
    view.axis = TarvexAuthoredPMIAxis{{0, 0, 5}, {1, 0, 0}, {0, 1, 0}};
    EXPECT_EQ(load<VizViewSemanticPMILoader>(model.MakePMIObject<TarvexPMIAnnotationView>(view)),
              "Name : Front\nLabel : \nID : V-1\nHidden : false\n"
              "Plane_Origin : (0.000000, 0.000000, 5.000000)\n"
              "Plane_UDir : (1.000000, 0.000000, 0.000000)\n"
              "Plane_VDir : (0.000000, 1.000000, 0.000000)\n");

    auto capture = named<TarvexAuthoredPMICapture>(u"Inspection", u"C-1");
    capture.hidden = true; // the capture's own attributes say otherwise, and win
    capture.current = true;
    capture.hiddenText = u"-";
    capture.camera = {u"Cam", TarvexPMI_Camera_Orthographic, {0, 0, 100}, {0, 0, 0}, {0, 1, 0}, 0,
                      2};
    capture.clippingPlane = TarvexAuthoredPMIClippingPlane{{0, 0, 1}, {0, 0, -1}};
    capture.annotations = {
        std::make_shared<TarvexAuthoredPMIGDT>(named<TarvexAuthoredPMIGDT>(u"", u"GDT-3")),
        std::make_shared<TarvexAuthoredPMINote>(named<TarvexAuthoredPMINote>(u"", u"N-1"))};
    capture.managesBodies = true;
    // A part entity, one held through two levels of instances, and one that ends in no part.
    capture.bodies = {{{}, 11, std::nullopt, true},
                      {{1, 2}, 12, std::nullopt, true},
                      {{3}, 13, std::nullopt, false}};
    SemanticPMI record;
    TarvexPMICapture object = model.MakePMIObject<TarvexPMICapture>(capture);
    VizCapturePMILoader loader(object, record);
    loader.Load();
    EXPECT_EQ(text(record),
              "Name : Inspection\nLabel : \nID : C-1\nAnnotations : GDT-3, N-1\n"
              "Camera_Angle : 0.000000\nCamera_Name : Cam\n"
              "Camera_Position : (0.000000, 0.000000, 100.000000)\n"
              "Camera_Target : (0.000000, 0.000000, 0.000000)\n"
              "Camera_Type : TarvexPMI_Camera_Orthographic\n"
              "Camera_UpDirection : (0.000000, 1.000000, 0.000000)\nCamera_Zoom : 2.000000\n"
              "Clip_Normal : (0.000000, 0.000000, -1.000000)\n"
              "Clip_Origin : (0.000000, 0.000000, 1.000000)\nCurrent : true\nHidden : false\n"
              "Hidden_Text : -\nManages_Geometry : 1\n");
    std::vector<unsigned int> ids;
    for (TarvexEntity const& entity : loader.GetEntities())
        ids.push_back(entity.GetEntityId());
    EXPECT_EQ(ids, (std::vector<unsigned int>{11, 12}));

    // No camera, no clipping, no annotations, bodies not managed: never walked.
    capture = named<TarvexAuthoredPMICapture>(u"Plain", u"C-2");
    capture.bodies = {{{}, 11, std::nullopt, true}};
    model.Faults().Add({"TarvexPMICapture::GetBodyIterator", std::nullopt,
                        TarvexFaultKind::StdException, "planned"});
    EXPECT_EQ(load<VizCapturePMILoader>(model.MakePMIObject<TarvexPMICapture>(capture)),
              "Name : Plain\nLabel : \nID : C-2\nAnnotations : \nCurrent : false\n"
              "Hidden : false\nHidden_Text : \nManages_Geometry : 0\n");
}

TEST(SemanticLoader, SecondLoaderOnOneRecordRewritesTheSameValues) {
    TarvexModel model;
    TarvexPMIDimension dimension = model.MakePMIObject<TarvexPMIDimension>(diameter());
    SemanticPMI twice;
    VizAnnotationPMILoader first(dimension, twice);
    first.Load();
    EXPECT_EQ(first.GetEntities().size(), 0u);
    VizDimensionSemanticPMILoader(dimension, twice).Load();
    EXPECT_EQ(text(twice), load<VizDimensionSemanticPMILoader>(dimension));
}

// A vocabulary under the throw switch, or a planned fault of the import library, ends the
// loader where it stands: the record keeps what was written before, and nothing leaks.
TEST(SemanticLoader, ExceptionLeavesTheKeysWrittenSoFar) {
    struct Case {
        char const* fault; ///< planned operation; null: an unknown enumeration value
        char const* lastWritten;
        char const* firstSkipped;
    };
    for (Case const& row : {Case{nullptr, "MainType", "SubType"},
                            Case{"TarvexPMIDimension::GetValue", "Coordinate", "Value"},
                            Case{"TarvexPMIDimension::IsDriving", "FakeValue", "DrivingDim"}}) {
        TarvexModel model;
        TarvexAuthoredPMIDimension record = diameter();
        KolbaVizCore::ScopedAllowThrow allow(row.fault == nullptr);
        if (row.fault)
            model.Faults().Add({row.fault, std::nullopt, TarvexFaultKind::StdException, "planned"});
        else
            record.subType = static_cast<TarvexPMIDimensionSubType>(27);
        TarvexPMIDimension dimension = model.MakePMIObject<TarvexPMIDimension>(record);
        SemanticPMI out;
        EXPECT_THROW(VizDimensionSemanticPMILoader(dimension, out).Load(), std::exception);
        EXPECT_EQ(out.ID, u"DIM-7");
        EXPECT_TRUE(out.Properties.count(u"Leader"));
        EXPECT_TRUE(out.Properties.count(VizPort::Widen(row.lastWritten))) << row.lastWritten;
        EXPECT_FALSE(out.Properties.count(VizPort::Widen(row.firstSkipped))) << row.firstSkipped;
    }
}

// Objects that a careless host made without a model or record read as empty objects: every
// loader still gives a record, with the keys that are always written.
TEST(SemanticLoader, DefaultObjectsReadAsEmptyObjects) {
    std::vector<std::pair<std::string, std::string>> const rows = {
        {load<VizGDTSemanticPMILoader>(TarvexPMIGDT()), "IsComposite : false\n"},
        {load<VizNoteSemanticPMILoader>(TarvexPMINote()), "Flag Note : false\n"},
        {load<VizDatumTargetSemanticPMILoader>(TarvexPMIDatumTarget(), WString(u"_0")),
         "_0Upper : \n"},
        {load<VizRoughnessSemanticPMILoader>(TarvexPMIRoughness()), "Count : 0\n"},
        {load<VizViewSemanticPMILoader>(TarvexPMIAnnotationView()), "Hidden : false\n"},
        {load<VizCapturePMILoader>(TarvexPMICapture()), "Manages_Geometry : 0\n"},
        {load<VizDimensionSemanticPMILoader>(TarvexPMIDimension()), "Value : 0.000000\n"},
    };
    for (auto const& [record, key] : rows) {
        EXPECT_EQ(record.rfind("Name : \nLabel : \nID : \n", 0), 0u) << record;
        EXPECT_NE(record.find(key), std::string::npos) << record;
    }
}
