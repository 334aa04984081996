#include "TarvexTestText.h"

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>

#include <gtest/gtest.h>

#include <optional>
#include <ostream>
#include <stdexcept>
#include <utility>

namespace {

/// An assembly "Housing" (10) at the root, holding two instances of the part "Shaft" (20).
/// Every optional value is present.
TarvexModel MakeFullModel() {
    TarvexModel model;
    model.SetProductName(u"Gearbox");
    model.SetUnits(TarvexLengthUnit_Millimeter);
    model.AddAssembly(10, u"Housing", u"housing.asm");
    model.AddPart(20, u"Shaft", u"shaft.prt");

    TarvexAuthoredInstance& root = model.AddRootInstance(10, u"Housing.1");
    TarvexPlacement placement;
    double const rotation[3][3] = {{0, -1, 0}, {1, 0, 0}, {0, 0, 1}};
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) {
            placement.rotation[row][column] = rotation[row][column];
        }
        placement.translation[row] = 5.0 + row;
    }
    root.placement = placement;
    root.rgb = {{10, 20, 300}};
    root.alpha = 128;
    root.hidden = true;
    root.suppressed = false;

    model.AddInstance(10, 20, u"Shaft.1");
    model.AddInstance(10, 20, u"Shaft.2").hidden = false;

    TarvexAuthoredDocument& document = model.Document();
    document.fileName = u"gearbox.asm";
    document.author = u"A. Author";
    document.organization = u"Works";
    document.sourceSystem = u"CAD 9";
    document.version = u"3";
    document.unit = u"mm";
    document.comment = u"";
    document.formatType = u"native";

    model.AddMissingFile(u"bolt.prt");
    model.AddMissingFile(u"nut.prt");
    return model;
}

TEST(TarvexModelTest, ReadsBackEverythingAuthored) {
    TarvexModel const model = MakeFullModel();
    TarvexInputProductStructure const structure = model.GetInputProductStructure();

    EXPECT_EQ(TextOf(structure.GetProductName()), u"Gearbox");
    EXPECT_EQ(structure.GetUnits(), TarvexLengthUnit_Millimeter);
    EXPECT_EQ(structure.GetUniqueReferencesCount(), 2);
    ASSERT_EQ(structure.GetRootInstancesCount(), 1);

    TarvexInputPSInstance const root = structure.GetRootInstance(0);
    EXPECT_EQ(TextOf(root.GetInstanceName()), u"Housing.1");
    double rotation[3][3] = {};
    double translation[3] = {};
    EXPECT_TRUE(root.GetInstancePositionMatrix(rotation, translation));
    EXPECT_EQ(rotation[0][1], -1.0);
    EXPECT_EQ(rotation[1][0], 1.0);
    EXPECT_EQ(rotation[0][0], 0.0);
    EXPECT_EQ(rotation[2][2], 1.0);
    EXPECT_EQ(translation[0], 5.0);
    EXPECT_EQ(translation[2], 7.0);
    unsigned short red = 0, green = 0, blue = 0, alpha = 0;
    EXPECT_TRUE(root.GetRGBColor(red, green, blue));
    EXPECT_EQ(red, 10);
    EXPECT_EQ(green, 20);
    EXPECT_EQ(blue, 300);
    EXPECT_TRUE(root.GetAlphaColor(alpha));
    EXPECT_EQ(alpha, 128);
    bool hidden = false, suppressed = true;
    EXPECT_TRUE(root.GetHidden(hidden));
    EXPECT_TRUE(hidden);
    EXPECT_TRUE(root.GetSuppressed(suppressed));
    EXPECT_FALSE(suppressed);

    TarvexInputPSReference const housing = root.GetReference();
    EXPECT_EQ(housing.GetUniqueID(), 10u);
    EXPECT_FALSE(housing.IsPart());
    EXPECT_EQ(TextOf(housing.GetReferenceName()), u"Housing");
    EXPECT_EQ(TextOf(housing.GetStorageName()), u"housing.asm");
    ASSERT_EQ(housing.GetInstancesCount(), 2);
    EXPECT_EQ(TextOf(housing.GetInstance(0).GetInstanceName()), u"Shaft.1");
    EXPECT_EQ(TextOf(housing.GetInstance(1).GetInstanceName()), u"Shaft.2");

    TarvexInputPSReference const shaft = housing.GetInstance(1).GetReference();
    EXPECT_EQ(shaft.GetUniqueID(), 20u);
    EXPECT_TRUE(shaft.IsPart());
    EXPECT_EQ(shaft.GetInstancesCount(), 0);
    EXPECT_EQ(TextOf(shaft.GetStorageName()), u"shaft.prt");
    TarvexPartDocument const part = shaft.GetDocument();
    EXPECT_TRUE(part.IsValid());
    EXPECT_EQ(part.GetReferenceId(), 20u);
    EXPECT_EQ(TextOf(part.GetName()), u"Shaft");

    TarvexDocument document = model.GetDocument();
    TarvexDocumentInformation const information = document.GetInformation();
    TarvexWString text;
    EXPECT_TRUE(information.GetFileName(text));
    EXPECT_EQ(TextOf(text), u"gearbox.asm");
    EXPECT_TRUE(information.GetAuthor(text));
    EXPECT_EQ(TextOf(text), u"A. Author");
    EXPECT_TRUE(information.GetOrganization(text));
    EXPECT_EQ(TextOf(text), u"Works");
    EXPECT_TRUE(information.GetSourceSystem(text));
    EXPECT_EQ(TextOf(text), u"CAD 9");
    EXPECT_TRUE(information.GetVersion(text));
    EXPECT_EQ(TextOf(text), u"3");
    EXPECT_TRUE(information.GetUnit(text));
    EXPECT_EQ(TextOf(text), u"mm");
    EXPECT_TRUE(information.GetComment(text));
    EXPECT_EQ(TextOf(text), u""); // present, though empty
    EXPECT_TRUE(information.GetFormatType(text));
    EXPECT_EQ(TextOf(text), u"native");

    TarvexInputPSMissingFileIter missing = model.GetImportResult().GetMissingFileIterator();
    EXPECT_EQ(missing.GetCount(), 2);
    ASSERT_TRUE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), u"bolt.prt");
    ASSERT_TRUE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), u"nut.prt");
    EXPECT_FALSE(missing.Next());
}

TEST(TarvexModelTest, ReadsBackEverythingAbsent) {
    TarvexModel model;
    model.AddAssembly(1, std::nullopt);
    model.AddRootInstance(1, std::nullopt);
    model.AddInstance(1, 1, std::nullopt);
    model.AddMissingFile(std::nullopt);

    TarvexInputProductStructure const structure = model.GetInputProductStructure();
    EXPECT_EQ(TextOf(structure.GetProductName()), std::nullopt);
    EXPECT_EQ(structure.GetUnits(), TarvexLengthUnit_Unknown);

    TarvexInputPSInstance const root = structure.GetRootInstance(0);
    EXPECT_EQ(TextOf(root.GetInstanceName()), std::nullopt);
    double rotation[3][3] = {{9, 9, 9}, {9, 9, 9}, {9, 9, 9}};
    double translation[3] = {9, 9, 9};
    EXPECT_FALSE(root.GetInstancePositionMatrix(rotation, translation));
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) {
            EXPECT_EQ(rotation[row][column], row == column ? 1.0 : 0.0);
        }
        EXPECT_EQ(translation[row], 0.0);
    }

    TarvexInputPSReference const reference = root.GetReference();
    EXPECT_EQ(reference.GetUniqueID(), 1u);
    EXPECT_EQ(TextOf(reference.GetReferenceName()), std::nullopt);
    EXPECT_EQ(TextOf(reference.GetStorageName()), std::nullopt);
    EXPECT_EQ(TextOf(reference.GetDocument().GetName()), std::nullopt);

    TarvexInputPSMissingFileIter missing = model.GetImportResult().GetMissingFileIterator();
    EXPECT_EQ(missing.GetCount(), 1);
    ASSERT_TRUE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), std::nullopt);
    EXPECT_FALSE(missing.Next());
}

TEST(TarvexModelTest, GivesInstanceIdsInOrderFromOne) {
    TarvexModel model;
    model.AddAssembly(7, u"A");
    EXPECT_EQ(model.AddRootInstance(7, u"r").instanceId, 1u);
    EXPECT_EQ(model.AddInstance(7, 8, u"c1").instanceId, 2u);
    EXPECT_EQ(model.AddRootInstance(8, u"r2").instanceId, 3u);
    EXPECT_EQ(model.AddInstance(7, 8, u"c2").instanceId, 4u);
    EXPECT_EQ(model.FindReference(7)->instances, (std::vector<unsigned int>{2, 4}));

    TarvexInputProductStructure const structure = model.GetInputProductStructure();
    ASSERT_EQ(structure.GetRootInstancesCount(), 2);
    EXPECT_EQ(TextOf(structure.GetRootInstance(0).GetInstanceName()), u"r");
    EXPECT_EQ(TextOf(structure.GetRootInstance(1).GetInstanceName()), u"r2");
}

TEST(TarvexModelTest, RecordsStayValidWhileTheModelGrows) {
    TarvexModel model;
    TarvexAuthoredReference& first = model.AddAssembly(1, u"first");
    TarvexAuthoredInstance& firstInstance = model.AddRootInstance(1, u"i1");
    for (unsigned int id = 2; id < 500; ++id) {
        model.AddPart(id, u"p");
        model.AddInstance(1, id, u"i");
    }
    first.name = u"renamed";
    firstInstance.name = u"renamed instance";
    TarvexInputPSInstance const root = model.GetInputProductStructure().GetRootInstance(0);
    EXPECT_EQ(TextOf(root.GetInstanceName()), u"renamed instance");
    EXPECT_EQ(TextOf(root.GetReference().GetReferenceName()), u"renamed");
    EXPECT_EQ(root.GetReference().GetInstancesCount(), 498);
}

TEST(TarvexModelTest, AddInstanceBelowAnUnknownParentThrowsAndAddsNothing) {
    TarvexModel model;
    model.AddAssembly(1, u"A");
    EXPECT_THROW(model.AddInstance(2, 1, u"lost"), std::invalid_argument);
    EXPECT_EQ(model.AddInstance(1, 1, u"kept").instanceId, 1u);
    EXPECT_EQ(model.FindReference(1)->instances.size(), 1u);
}

TEST(TarvexModelTest, AddingAKnownReferenceAgainKeepsTheFirstRecord) {
    TarvexModel model;
    TarvexAuthoredReference& part = model.AddPart(5, u"first", u"first.prt");
    TarvexAuthoredReference& again = model.AddAssembly(5, u"second", u"second.asm");
    EXPECT_EQ(&part, &again);
    EXPECT_TRUE(again.isPart);
    EXPECT_EQ(again.name, u"first");
    EXPECT_EQ(again.storageName, u"first.prt");
    EXPECT_EQ(model.FindReference(6), nullptr);
}

TEST(TarvexModelTest, AnInstanceOfAnUnknownReferenceGivesAnEmptyReference) {
    TarvexModel model;
    model.AddRootInstance(99, u"dangling");
    TarvexInputPSReference const reference =
        model.GetInputProductStructure().GetRootInstance(0).GetReference();
    EXPECT_EQ(reference.GetUniqueID(), 0u);
    EXPECT_FALSE(reference.IsPart());
    EXPECT_EQ(reference.GetInstancesCount(), 0);
    EXPECT_EQ(TextOf(reference.GetReferenceName()), std::nullopt);
    EXPECT_FALSE(reference.GetDocument().IsValid());
}

TEST(TarvexModelTest, IndexesOutOfRangeGiveEmptyInstances) {
    TarvexModel const model = MakeFullModel();
    TarvexInputProductStructure const structure = model.GetInputProductStructure();
    TarvexInputPSReference const housing = structure.GetRootInstance(0).GetReference();
    for (TarvexInputPSInstance const& instance :
         {structure.GetRootInstance(-1), structure.GetRootInstance(1), housing.GetInstance(-1),
          housing.GetInstance(2)}) {
        EXPECT_EQ(TextOf(instance.GetInstanceName()), std::nullopt);
        EXPECT_EQ(instance.GetReference().GetUniqueID(), 0u);
    }
}

struct UniqueCountCase {
    char const* name;
    void (*author)(TarvexModel&);
    int expected;
};

void PrintTo(UniqueCountCase const& c, std::ostream* os) {
    *os << c.name;
}

class TarvexUniqueReferencesCountTest : public ::testing::TestWithParam<UniqueCountCase> {};

TEST_P(TarvexUniqueReferencesCountTest, CountsOrOverrides) {
    TarvexModel model;
    GetParam().author(model);
    EXPECT_EQ(model.GetInputProductStructure().GetUniqueReferencesCount(), GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Cases, TarvexUniqueReferencesCountTest,
                         ::testing::Values(UniqueCountCase{"Empty", [](TarvexModel&) {}, 0},
                                           UniqueCountCase{"SharedPartCountsOnce",
                                                           [](TarvexModel& m) {
                                                               m.AddAssembly(1, u"A");
                                                               m.AddAssembly(2, u"B");
                                                               m.AddPart(3, u"P");
                                                               m.AddRootInstance(1, u"a");
                                                               m.AddRootInstance(2, u"b");
                                                               m.AddInstance(1, 3, u"p1");
                                                               m.AddInstance(2, 3, u"p2");
                                                               m.AddInstance(2, 3, u"p3");
                                                           },
                                                           3},
                                           UniqueCountCase{"UnplacedReferenceIsNotCounted",
                                                           [](TarvexModel& m) {
                                                               m.AddPart(1, u"P");
                                                               m.AddPart(2, u"unplaced");
                                                               m.AddRootInstance(1, u"p");
                                                           },
                                                           1},
                                           UniqueCountCase{"PlacedButUndefinedIsNotCounted",
                                                           [](TarvexModel& m) {
                                                               m.AddPart(1, u"P");
                                                               m.AddRootInstance(1, u"p");
                                                               m.AddRootInstance(42, u"nowhere");
                                                           },
                                                           1},
                                           UniqueCountCase{"AssemblyInsideItselfEnds",
                                                           [](TarvexModel& m) {
                                                               m.AddAssembly(1, u"A");
                                                               m.AddRootInstance(1, u"a");
                                                               m.AddInstance(1, 1, u"again");
                                                           },
                                                           1},
                                           UniqueCountCase{"OverrideWins",
                                                           [](TarvexModel& m) {
                                                               m.AddPart(1, u"P");
                                                               m.AddRootInstance(1, u"p");
                                                               m.SetUniqueReferencesCount(7);
                                                           },
                                                           7},
                                           UniqueCountCase{"OverrideOfZero",
                                                           [](TarvexModel& m) {
                                                               m.AddPart(1, u"P");
                                                               m.AddRootInstance(1, u"p");
                                                               m.SetUniqueReferencesCount(0);
                                                           },
                                                           0},
                                           UniqueCountCase{"OverrideRemoved",
                                                           [](TarvexModel& m) {
                                                               m.AddPart(1, u"P");
                                                               m.AddRootInstance(1, u"p");
                                                               m.SetUniqueReferencesCount(7);
                                                               m.SetUniqueReferencesCount(
                                                                   std::nullopt);
                                                           },
                                                           1}),
                         [](::testing::TestParamInfo<UniqueCountCase> const& info) {
                             return info.param.name;
                         });

TEST(TarvexModelTest, ValueObjectsSeeAuthoringDoneAfterTheyWereHandedOut) {
    TarvexModel model;
    TarvexInputProductStructure const structure = model.GetInputProductStructure();
    EXPECT_EQ(structure.GetRootInstancesCount(), 0);
    model.AddPart(1, u"P");
    model.AddRootInstance(1, u"p");
    model.SetProductName(u"Later");
    EXPECT_EQ(structure.GetRootInstancesCount(), 1);
    EXPECT_EQ(TextOf(structure.GetProductName()), u"Later");
}

TEST(TarvexModelTest, ValueObjectsKeepTheDataAliveAfterTheModelIsGone) {
    TarvexInputPSInstance root;
    TarvexInputPSMissingFileIter missing;
    TarvexDocumentInformation information;
    {
        TarvexModel const model = MakeFullModel();
        root = model.GetInputProductStructure().GetRootInstance(0);
        missing = model.GetImportResult().GetMissingFileIterator();
        information = model.GetDocument().GetInformation();
    }
    EXPECT_EQ(TextOf(root.GetInstanceName()), u"Housing.1");
    EXPECT_EQ(TextOf(root.GetReference().GetInstance(0).GetReference().GetReferenceName()),
              u"Shaft");
    ASSERT_TRUE(missing.Next());
    EXPECT_EQ(TextOf(missing.Current()), u"bolt.prt");
    TarvexWString author;
    EXPECT_TRUE(information.GetAuthor(author));
    EXPECT_EQ(TextOf(author), u"A. Author");
}

TEST(TarvexModelTest, MovingHandsTheDataOnAndLeavesAnEmptyModel) {
    TarvexModel source = MakeFullModel();
    TarvexInputProductStructure const before = source.GetInputProductStructure();
    TarvexModel target = std::move(source);

    EXPECT_EQ(TextOf(target.GetInputProductStructure().GetProductName()), u"Gearbox");
    EXPECT_EQ(before.GetRootInstancesCount(), 1);
    // The moved-from model is still usable: first empty, then a new model of its own.
    EXPECT_EQ(source.GetInputProductStructure().GetRootInstancesCount(), 0); // NOLINT
    EXPECT_EQ(source.FindReference(10), nullptr);
    source.AddPart(1, u"fresh");
    EXPECT_EQ(source.AddRootInstance(1, u"one").instanceId, 1u);
    EXPECT_EQ(source.GetInputProductStructure().GetRootInstancesCount(), 1);
    EXPECT_EQ(target.GetInputProductStructure().GetRootInstancesCount(), 1);

    target = std::move(source);
    EXPECT_EQ(TextOf(target.GetInputProductStructure().GetRootInstance(0).GetInstanceName()),
              u"one");
    EXPECT_EQ(TextOf(before.GetProductName()), u"Gearbox");
}

} // namespace
