#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/semantic/PMIVocabulary.h>

#include <gtest/gtest.h>

#include <functional>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

using namespace VizBridgeTarvex;
using VizPort::WString;

namespace {

struct Vocabulary {
    char const* error; ///< also names the row
    std::function<WString(int)> toText;
    int count;
    char16_t const* defaultText;
    std::vector<std::pair<int, char16_t const*>> samples; ///< first, last and notable values
};

template <class Enum> std::function<WString(int)> call(WString (*function)(Enum)) {
    return [function](int value) { return function(static_cast<Enum>(value)); };
}

std::vector<Vocabulary> const& vocabularies() {
    static std::vector<Vocabulary> const rows = {
        {"Unknown type of TarvexPMIOrientation",
         call(&OrientationToText),
         5,
         u"TarvexPMI_Unknown",
         {{0, u"TarvexPMI_Horizontal"}, {4, u"TarvexPMI_DimAngle"}}},
        {"Unknown type of TarvexPMICameraType",
         call(&CameraTypeToText),
         3,
         u"TarvexPMI_Camera_Unknown",
         {{0, u"TarvexPMI_Camera_Unknown"}, {2, u"TarvexPMI_Camera_Orthographic"}}},
        {"Unknown type of TarvexPMIDatumTargetType",
         call(&DatumTargetTypeToText),
         8,
         u"TarvexPMI_DTT_Unknown",
         {{0, u"TarvexPMI_DTT_Unknown"}, {7, u"TarvexPMI_DTT_UserDefined"}}},
        {"Unknown type of TarvexPMIDimensionMainType",
         call(&DimensionMainTypeToText),
         5,
         u"TarvexPMI_DMT_Unknown",
         {{0, u"TarvexPMI_DMT_Unknown"}, {4, u"TarvexPMI_DMT_CoordDim"}}},
        {"Unknown type of TarvexPMIDimensionSubType",
         call(&DimensionSubTypeToText),
         27,
         u"TarvexPMI_Unknown",
         {{0, u"TarvexPMI_Distance"},
          {10, u"TarvexPMI_Diameter"},
          {26, u"TarvexPMI_CoordDimension_3D"}}},
        {"Unknown type of TarvexPMIUnit",
         call(&UnitToText),
         14,
         u"TarvexPMI_DimUnitNone",
         {{0, u"TarvexPMI_DimUnitNone"},
          {1, u"TarvexPMI_DimUnitMM"},
          {13, u"TarvexPMI_DimUnitRADIAN"}}},
        {"Unknown type of TarvexPMIArrowSymbol",
         call(&ArrowSymbolToText),
         32,
         u"TarvexPMI_NOTUSED",
         {{0, u"TarvexPMI_NOTUSED"}, {17, u"TarvexPMI_FILLED_ARROW"}, {31, u"TarvexPMI_WAVE"}}},
        {"Unknown type of TarvexPMIToleranceType",
         call(&ToleranceTypeToText),
         18,
         u"TarvexPMI_TOLTYPE_UNKNOWN",
         {{0, u"TarvexPMI_TOLTYPE_UNKNOWN"},
          {10, u"TarvexPMI_Location_TruePosition"},
          {17, u"TarvexPMI_RunOut_Total"}}},
        {"Unknown type of TarvexPMIToleranceValueType",
         call(&ToleranceValueTypeToText),
         5,
         u"TarvexPMI_ValueType_None",
         {{0, u"TarvexPMI_ValueType_None"}, {4, u"TarvexPMI_ValueType_Square"}}},
        {"Unknown type of TarvexPMIToleranceModifier",
         call(&ToleranceModifierToText),
         13,
         u"TarvexPMI_NoModifier",
         {{0, u"TarvexPMI_NoModifier"},
          {2, u"TarvexPMI_MaterialCondition_NoModifier"},
          {12, u"TarvexPMI_Statistical_Symbol"}}},
        {"Unknown type of TarvexPMIFont",
         call(&FontToText),
         9,
         u"TarvexPMI_Unknown",
         {{0, u"TarvexPMI_Simplex"}, {8, u"TarvexPMI_IGES_1003"}}},
        {"Unknown type of TarvexPMIRoughnessObtentionType",
         call(&RoughnessObtentionTypeToText),
         4,
         u"TarvexPMI_Unknown",
         {{0, u"TarvexPMI_RO_UnSupported"}, {3, u"TarvexPMI_RO_MachiningForbidden"}}},
        {"Unknown type of TarvexPMIRoughnessApplicabilityType",
         call(&RoughnessApplicabilityTypeToText),
         4,
         u"TarvexPMI_Unknown",
         {{0, u"TarvexPMI_RA_UnSupported"}, {3, u"TarvexPMI_RA_BasicSurface"}}},
    };
    return rows;
}

} // namespace

// Over each whole range: every value has its own text, and only value 0 may share the
// default; outside the range the default comes back, or the error is thrown under the switch.
TEST(PMIVocabulary, EveryValueHasItsNameAndUnknownValuesFollowTheThrowSwitch) {
    for (Vocabulary const& row : vocabularies()) {
        SCOPED_TRACE(row.error);
        KolbaVizCore::ScopedAllowThrow const allow(true);
        std::set<WString> texts;
        for (int value = 0; value < row.count; ++value) {
            WString const text = row.toText(value);
            EXPECT_EQ(text.rfind(u"TarvexPMI_", 0), 0u);
            EXPECT_TRUE(texts.insert(text).second) << value;
            EXPECT_TRUE(value == 0 || text != row.defaultText) << value;
        }
        for (auto const& [value, expected] : row.samples) {
            EXPECT_EQ(row.toText(value), expected) << value;
        }
        for (int unknown : {row.count, -1}) {
            try {
                row.toText(unknown);
                ADD_FAILURE() << "no throw for " << unknown;
            } catch (std::exception const& error) {
                EXPECT_STREQ(error.what(), row.error);
            }
            KolbaVizCore::ScopedAllowThrow const quiet(false);
            EXPECT_EQ(row.toText(unknown), row.defaultText) << unknown;
        }
    }
}

TEST(PMIVocabulary, AnnotationClassesByNumber) {
    KolbaVizCore::ScopedAllowThrow const allow(true);
    std::vector<std::pair<int, char16_t const*>> const rows = {
        {0, u"TarvexPMI_UnknownType"}, {1, u"TarvexPMI_Datum"},       {2, u"TarvexPMI_DatumTarget"},
        {3, u"TarvexPMI_Note"},        {4, u"TarvexPMI_FlagNote"},    {5, u"TarvexPMI_NOA"},
        {6, u"TarvexPMI_Roughness"},   {7, u"TarvexPMI_GDT"},         {8, u"TarvexPMI_Dimension"},
        {9, u"TarvexPMI_UnknownType"}, {-1, u"TarvexPMI_UnknownType"}};
    for (auto const& [value, expected] : rows) {
        EXPECT_EQ(AnnotationTypeToText(value), expected) << value;
    }
}
