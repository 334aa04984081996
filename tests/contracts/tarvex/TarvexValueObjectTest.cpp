#include "TarvexTestText.h"

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/contracts/tarvex/TarvexPolicy.h>

#include <gtest/gtest.h>

#include <optional>

namespace {

TEST(TarvexWStringTest, TellsAbsentTextFromEmptyText) {
    EXPECT_EQ(TextOf(TarvexWString()), std::nullopt);
    EXPECT_EQ(TextOf(TarvexWString(static_cast<char16_t const*>(nullptr))), std::nullopt);
    EXPECT_EQ(TextOf(TarvexWString(std::optional<VizPort::WString>())), std::nullopt);
    EXPECT_EQ(TextOf(TarvexWString(u"")), u"");
    EXPECT_EQ(TextOf(TarvexWString(VizPort::WString(u"a\u00e9\u4e2d"))), u"a\u00e9\u4e2d");
    EXPECT_FALSE(TarvexWString().HasText());
    EXPECT_EQ(TarvexWString().ToWString(), u"");
    EXPECT_TRUE(TarvexWString(u"").HasText());
}

TEST(TarvexPolicyTest, AnswersOnlyForOptionsThatAreSet) {
    TarvexPolicy policy;
    bool value = true;
    EXPECT_FALSE(policy.GetOption("tessellate", value));
    EXPECT_TRUE(value);
    policy.SetOption("tessellate", false);
    EXPECT_TRUE(policy.GetOption("tessellate", value));
    EXPECT_FALSE(value);
    policy.SetOption("tessellate", true);
    EXPECT_TRUE(policy.GetOption("tessellate", value));
    EXPECT_TRUE(value);
    value = false;
    EXPECT_FALSE(policy.GetOption("Tessellate", value));
    EXPECT_FALSE(value);
}

TEST(TarvexDefaultHandlesTest, AnswerEmptyWithoutAModel) {
    TarvexInputProductStructure const structure;
    EXPECT_EQ(TextOf(structure.GetProductName()), std::nullopt);
    EXPECT_EQ(structure.GetUniqueReferencesCount(), 0);
    EXPECT_EQ(structure.GetRootInstancesCount(), 0);
    EXPECT_EQ(structure.GetUnits(), TarvexLengthUnit_Unknown);
    EXPECT_EQ(TextOf(structure.GetRootInstance(0).GetInstanceName()), std::nullopt);

    TarvexInputPSInstance const instance;
    EXPECT_EQ(TextOf(instance.GetInstanceName()), std::nullopt);
    EXPECT_EQ(instance.GetReference().GetUniqueID(), 0u);

    TarvexInputPSReference const reference;
    EXPECT_EQ(TextOf(reference.GetReferenceName()), std::nullopt);
    EXPECT_EQ(TextOf(reference.GetStorageName()), std::nullopt);
    EXPECT_FALSE(reference.IsPart());
    EXPECT_EQ(reference.GetUniqueID(), 0u);
    EXPECT_EQ(reference.GetInstancesCount(), 0);
    EXPECT_EQ(TextOf(reference.GetInstance(0).GetInstanceName()), std::nullopt);
    EXPECT_FALSE(reference.GetDocument().IsValid());

    TarvexPartDocument const part;
    EXPECT_FALSE(part.IsValid());
    EXPECT_EQ(part.GetReferenceId(), 0u);
    EXPECT_EQ(TextOf(part.GetName()), std::nullopt);

    TarvexDocument document;
    TarvexWString text(u"kept");
    EXPECT_FALSE(document.GetInformation().GetFileName(text));
    EXPECT_EQ(TextOf(text), u"kept");

    TarvexInputPSMissingFileIter missing = TarvexPSImportResult().GetMissingFileIterator();
    EXPECT_EQ(missing.GetCount(), 0);
    EXPECT_FALSE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), std::nullopt);
}

TEST(TarvexDefaultHandlesTest, AFaultPlanOnSomeModelDoesNotReachThem) {
    // A default object has no model, so no plan can make it throw.
    TarvexModel model;
    TarvexFault fault;
    fault.operation = "TarvexInputPSReference::GetUniqueID";
    model.Faults().Add(fault);
    EXPECT_NO_THROW(TarvexInputPSReference().GetUniqueID());
    EXPECT_EQ(model.Faults().GetFiredCount(), 0);
}

TEST(TarvexMissingFileIterTest, NextComesBeforeCurrentAndStopsAtTheEnd) {
    TarvexModel model;
    model.AddMissingFile(u"a.prt");
    model.AddMissingFile(std::nullopt);
    model.AddMissingFile(u"c.prt");
    TarvexInputPSMissingFileIter missing = model.GetImportResult().GetMissingFileIterator();

    EXPECT_EQ(missing.GetCount(), 3);
    EXPECT_EQ(TextOf(missing.Current()), std::nullopt) << "Current before the first Next";
    ASSERT_TRUE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), u"a.prt");
    EXPECT_EQ(TextOf(missing.Current()), u"a.prt") << "Current does not advance";
    ASSERT_TRUE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), std::nullopt) << "an absent name";
    ASSERT_TRUE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), u"c.prt");
    EXPECT_FALSE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), std::nullopt) << "Current past the end";
    EXPECT_FALSE(missing.Next()) << "stays at the end";
    EXPECT_EQ(missing.GetCount(), 3);
}

TEST(TarvexMissingFileIterTest, AnEmptyListEndsAtOnce) {
    TarvexModel model;
    TarvexInputPSMissingFileIter missing = model.GetImportResult().GetMissingFileIterator();
    EXPECT_EQ(missing.GetCount(), 0);
    EXPECT_FALSE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), std::nullopt);
}

} // namespace
