#include "TarvexTestText.h"

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>

#include <gtest/gtest.h>

#include <optional>
#include <ostream>
#include <string_view>
#include <vector>

namespace {

// Every optional getter answers false and leaves its argument alone when the value is
// absent, and answers true and overwrites it when the value is present.

struct DocumentGetterCase {
    char const* name;
    std::optional<VizPort::WString> TarvexAuthoredDocument::*field;
    bool (TarvexDocumentInformation::*getter)(TarvexWString&) const;
};

void PrintTo(DocumentGetterCase const& c, std::ostream* os) {
    *os << c.name;
}

class TarvexDocumentGetterTest : public ::testing::TestWithParam<DocumentGetterCase> {
protected:
    static TarvexDocumentInformation informationOf(TarvexModel const& model) {
        return model.GetDocument().GetInformation();
    }
};

TEST_P(TarvexDocumentGetterTest, AbsentLeavesTheArgumentAlone) {
    TarvexModel model;
    // Every other field is present, so that a getter reading the wrong field shows.
    TarvexAuthoredDocument& document = model.Document();
    document = TarvexAuthoredDocument{u"f", u"a", u"o", u"s", u"v", u"u", u"c", u"t"};
    document.*GetParam().field = std::nullopt;

    TarvexWString value(u"sentinel");
    EXPECT_FALSE((informationOf(model).*GetParam().getter)(value));
    EXPECT_EQ(TextOf(value), u"sentinel");
}

TEST_P(TarvexDocumentGetterTest, PresentOverwritesTheArgument) {
    TarvexModel model;
    model.Document().*GetParam().field = u"the value";
    TarvexWString value(u"sentinel");
    EXPECT_TRUE((informationOf(model).*GetParam().getter)(value));
    EXPECT_EQ(TextOf(value), u"the value");
}

TEST_P(TarvexDocumentGetterTest, DefaultInformationHasNoValues) {
    TarvexWString value(u"sentinel");
    EXPECT_FALSE((TarvexDocumentInformation().*GetParam().getter)(value));
    EXPECT_EQ(TextOf(value), u"sentinel");
}

INSTANTIATE_TEST_SUITE_P(
    AllFields, TarvexDocumentGetterTest,
    ::testing::Values(DocumentGetterCase{"FileName", &TarvexAuthoredDocument::fileName,
                                         &TarvexDocumentInformation::GetFileName},
                      DocumentGetterCase{"Author", &TarvexAuthoredDocument::author,
                                         &TarvexDocumentInformation::GetAuthor},
                      DocumentGetterCase{"Organization", &TarvexAuthoredDocument::organization,
                                         &TarvexDocumentInformation::GetOrganization},
                      DocumentGetterCase{"SourceSystem", &TarvexAuthoredDocument::sourceSystem,
                                         &TarvexDocumentInformation::GetSourceSystem},
                      DocumentGetterCase{"Version", &TarvexAuthoredDocument::version,
                                         &TarvexDocumentInformation::GetVersion},
                      DocumentGetterCase{"Unit", &TarvexAuthoredDocument::unit,
                                         &TarvexDocumentInformation::GetUnit},
                      DocumentGetterCase{"Comment", &TarvexAuthoredDocument::comment,
                                         &TarvexDocumentInformation::GetComment},
                      DocumentGetterCase{"FormatType", &TarvexAuthoredDocument::formatType,
                                         &TarvexDocumentInformation::GetFormatType}),
    [](::testing::TestParamInfo<DocumentGetterCase> const& info) { return info.param.name; });

/// The answer of a getter called on sentinel arguments, and whether they still hold them.
struct GetterOutcome {
    bool answer;
    bool untouched;
};

struct InstanceGetterCase {
    char const* name;
    /// Makes the value present, with a value that differs from the sentinel.
    void (*makePresent)(TarvexAuthoredInstance&);
    GetterOutcome (*readFromSentinel)(TarvexInputPSInstance const&);
};

void PrintTo(InstanceGetterCase const& c, std::ostream* os) {
    *os << c.name;
}

class TarvexInstanceGetterTest : public ::testing::TestWithParam<InstanceGetterCase> {
protected:
    /// A root instance with every optional value present except the one under test.
    static TarvexInputPSInstance instanceWith(TarvexModel& model, bool present) {
        TarvexAuthoredInstance& instance = model.AddRootInstance(1, u"i");
        for (InstanceGetterCase const& other : cases()) {
            if (present || std::string_view(other.name) != GetParam().name) {
                other.makePresent(instance);
            }
        }
        return model.GetInputProductStructure().GetRootInstance(0);
    }

public:
    static std::vector<InstanceGetterCase> const& cases();
};

std::vector<InstanceGetterCase> const& TarvexInstanceGetterTest::cases() {
    static std::vector<InstanceGetterCase> const all{
        {"Hidden", [](TarvexAuthoredInstance& i) { i.hidden = false; },
         [](TarvexInputPSInstance const& i) {
             bool value = true;
             bool const answer = i.GetHidden(value);
             return GetterOutcome{answer, value};
         }},
        {"Suppressed", [](TarvexAuthoredInstance& i) { i.suppressed = false; },
         [](TarvexInputPSInstance const& i) {
             bool value = true;
             bool const answer = i.GetSuppressed(value);
             return GetterOutcome{answer, value};
         }},
        {"RGBColor",
         [](TarvexAuthoredInstance& i) {
             i.rgb = {{0, 0, 0}};
         },
         [](TarvexInputPSInstance const& i) {
             unsigned short red = 7, green = 8, blue = 9;
             bool const answer = i.GetRGBColor(red, green, blue);
             return GetterOutcome{answer, red == 7 && green == 8 && blue == 9};
         }},
        {"AlphaColor", [](TarvexAuthoredInstance& i) { i.alpha = 0; },
         [](TarvexInputPSInstance const& i) {
             unsigned short alpha = 77;
             bool const answer = i.GetAlphaColor(alpha);
             return GetterOutcome{answer, alpha == 77};
         }},
    };
    return all;
}

TEST_P(TarvexInstanceGetterTest, AbsentLeavesTheArgumentsAlone) {
    TarvexModel model;
    GetterOutcome const outcome = GetParam().readFromSentinel(instanceWith(model, false));
    EXPECT_FALSE(outcome.answer);
    EXPECT_TRUE(outcome.untouched);
}

TEST_P(TarvexInstanceGetterTest, PresentOverwritesTheArguments) {
    TarvexModel model;
    GetterOutcome const outcome = GetParam().readFromSentinel(instanceWith(model, true));
    EXPECT_TRUE(outcome.answer);
    EXPECT_FALSE(outcome.untouched);
}

TEST_P(TarvexInstanceGetterTest, DefaultInstanceHasNoValues) {
    GetterOutcome const outcome = GetParam().readFromSentinel(TarvexInputPSInstance());
    EXPECT_FALSE(outcome.answer);
    EXPECT_TRUE(outcome.untouched);
}

INSTANTIATE_TEST_SUITE_P(AllValues, TarvexInstanceGetterTest,
                         ::testing::ValuesIn(TarvexInstanceGetterTest::cases()),
                         [](::testing::TestParamInfo<InstanceGetterCase> const& info) {
                             return info.param.name;
                         });

TEST(TarvexPositionMatrixTest, AbsentPlacementGivesTheIdentityOverAnyInput) {
    TarvexModel model;
    model.AddRootInstance(1, u"unplaced");
    TarvexInputPSInstance const unplaced = model.GetInputProductStructure().GetRootInstance(0);
    for (TarvexInputPSInstance const& instance : {unplaced, TarvexInputPSInstance()}) {
        double rotation[3][3] = {{2, 3, 4}, {5, 6, 7}, {8, 9, 10}};
        double translation[3] = {11, 12, 13};
        EXPECT_FALSE(instance.GetInstancePositionMatrix(rotation, translation));
        for (int row = 0; row < 3; ++row) {
            for (int column = 0; column < 3; ++column) {
                EXPECT_EQ(rotation[row][column], row == column ? 1.0 : 0.0);
            }
            EXPECT_EQ(translation[row], 0.0);
        }
    }
}

} // namespace
