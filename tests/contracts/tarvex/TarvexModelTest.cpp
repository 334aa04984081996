#include "support/TarvexTestProduct.h"

#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexLengthUnitUtils.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEntity.h>

#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

namespace {

/// The text as a reader sees it; "(none)" when there is none.
std::string Text(TarvexWString const& text) {
    std::optional<std::u16string> const value = TextOf(text);
    return value ? VizPort::Narrow(*value) : "(none)";
}

/// An instance and what it places on one line, and the instances below it indented.
void Describe(TarvexInputPSInstance const& instance, std::string const& indent, std::string& out) {
    TarvexInputPSReference const reference = instance.GetReference();
    out += indent + Text(instance.GetInstanceName()) + " -> " +
           std::to_string(reference.GetUniqueID()) + " " + Text(reference.GetReferenceName()) +
           " " + Text(reference.GetStorageName()) + (reference.IsPart() ? " part\n" : "\n");
    for (int index = 0; index < reference.GetInstancesCount(); ++index) {
        Describe(reference.GetInstance(index), indent + "  ", out);
    }
}

/// The product as its reader sees it: name, unit and reference count, then the instances.
std::string Describe(TarvexInputProductStructure const& structure) {
    std::string out = Text(structure.GetProductName()) + ", unit " +
                      std::to_string(structure.GetUnits()) + ", " +
                      std::to_string(structure.GetUniqueReferencesCount()) + " references\n";
    for (int index = 0; index < structure.GetRootInstancesCount(); ++index) {
        Describe(structure.GetRootInstance(index), "", out);
    }
    return out;
}

// The shared part counts once; the reference that was placed but never added is empty and
// not counted.
std::string const kProduct = R"(Gearbox, unit 4, 6 references
Top.1 -> 1 Top top.asm
  10.1 -> 10 P10 10.prt part
  20.1 -> 20 P20 20.prt part
  Sub.1 -> 2 Sub (none)
    30.1 -> 30 P30 30.prt part
    20.2 -> 20 P20 20.prt part
  20.3 -> 20 P20 20.prt part
  undefined -> 0 (none) (none)
40.1 -> 40 P40 40.prt part
)";

std::string const kEmpty = "(none), unit 0, 0 references\n";

TEST(TarvexModelTest, GivesInstanceIdsInOrderAndKeepsTheFirstRecordOfAReferenceValid) {
    TarvexModel model = MakeTestProduct();
    EXPECT_EQ(Describe(model.GetInputProductStructure()), kProduct);
    EXPECT_EQ(model.FindReference(1)->instances, (std::vector<unsigned int>{2, 3, 4, 7, 8}));
    EXPECT_THROW(model.AddInstance(99, 10, u"lost"), std::invalid_argument);
    TarvexAuthoredInstance& next = model.AddInstance(2, 10, u"next");
    EXPECT_EQ(next.instanceId, 10u) << "the failed call took no id";
    TarvexAuthoredReference& again = model.AddAssembly(10, u"other", u"other.asm");
    EXPECT_EQ(&again, model.FindReference(10));
    EXPECT_TRUE(again.isPart && again.name == u"P10" && again.storageName == u"10.prt");
    // Records stay valid while the model grows.
    for (unsigned int id = 100; id < 600; ++id) {
        model.AddPart(id, u"p");
        model.AddInstance(2, id, u"i");
    }
    again.name = u"renamed";
    next.name = u"renamed instance";
    TarvexInputPSReference const sub = model.GetInputProductStructure().GetReferenceFromId(2);
    EXPECT_EQ(sub.GetInstancesCount(), 503);
    EXPECT_EQ(Text(sub.GetInstance(2).GetInstanceName()), "renamed instance");
    EXPECT_EQ(Text(sub.GetInstance(2).GetReference().GetReferenceName()), "renamed");
}

TEST(TarvexModelTest, CountsTheUniqueReferencesReachableFromTheRootUnlessOverridden) {
    TarvexModel model;
    auto const count = [&model] {
        return model.GetInputProductStructure().GetUniqueReferencesCount();
    };
    model.AddAssembly(1, u"A");
    model.AddPart(2, u"unplaced");
    EXPECT_EQ(count(), 0);
    model.AddRootInstance(1, u"a");
    model.AddInstance(1, 1, u"inside itself");
    EXPECT_EQ(count(), 1);
    for (int const overridden : {7, 0}) {
        model.SetUniqueReferencesCount(overridden);
        EXPECT_EQ(count(), overridden);
    }
    model.SetUniqueReferencesCount(std::nullopt);
    EXPECT_EQ(count(), 1);
}

TEST(TarvexModelTest, ValueObjectsShareTheDataWhichMovesWithTheModelAndOutlivesIt) {
    auto source = std::make_unique<TarvexModel>(MakeTestProduct());
    TarvexInputProductStructure const before = source->GetInputProductStructure();
    TarvexModel target = std::move(*source);
    EXPECT_EQ(Describe(target.GetInputProductStructure()), kProduct);
    EXPECT_EQ(Describe(source->GetInputProductStructure()), kEmpty);
    EXPECT_EQ(Describe(TarvexInputProductStructure()), kEmpty);
    // A moved-from model starts afresh; handles see authoring done after they were handed out.
    source->AddPart(5, u"P5");
    TarvexInputProductStructure const later = source->GetInputProductStructure();
    EXPECT_EQ(source->AddRootInstance(5, u"5.1").instanceId, 1u);
    source->SetProductName(u"Later");
    target = std::move(*source);
    source.reset();
    std::string const laterProduct = "Later, unit 0, 1 references\n5.1 -> 5 P5 (none) part\n";
    EXPECT_EQ(Describe(target.GetInputProductStructure()), laterProduct);
    EXPECT_EQ(Describe(later), laterProduct);
    EXPECT_EQ(Describe(before), kProduct);
}

TEST(TarvexModelTest, MissingFilesComeOneAfterEachNextAndAFaultedNextDoesNotMove) {
    TarvexModel model;
    model.AddMissingFile(u"a.prt");
    model.AddMissingFile(std::nullopt);
    model.AddMissingFile(u"c.prt");
    TarvexFault fault = FaultOn("TarvexInputPSMissingFileIter::Next");
    fault.times = 1;
    model.Faults().Add(fault);
    TarvexInputPSMissingFileIter missing = model.GetImportResult().GetMissingFileIterator();
    EXPECT_EQ(missing.GetCount(), 3);
    std::vector<std::string> seen{Text(missing.Current())};
    EXPECT_THROW(missing.Next(), std::runtime_error);
    while (missing.Next()) {
        seen.push_back(Text(missing.Current()));
    }
    seen.push_back(Text(missing.Current()));
    EXPECT_FALSE(missing.Next());
    EXPECT_EQ(seen, (std::vector<std::string>{"(none)", "a.prt", "(none)", "c.prt", "(none)"}));
}

TEST(TarvexEntityTest, DescendsItsInstancePathToThePartEntity) {
    TarvexModel const model = MakeTestProduct();
    // Top.1, Sub.1, 30.1 down to face 30 of part 30, which "face-30" shows.
    TarvexEntity current = model.MakeEntity(TarvexAuthoredEntity{{1, 4, 5}, 30, u"face-30", true});
    std::string path;
    TarvexInstanceEntity step;
    TarvexVisuEntity part;
    while (!current.GetPartEntity(part) && current.GetInstanceEntity(step)) {
        path += Text(step.GetInstance().GetInstanceName()) + "/";
        current = step.GetEntity();
        EXPECT_EQ(current.GetEntityId(), 30u);
    }
    EXPECT_EQ(path, "Top.1/Sub.1/30.1/");
    TarvexWString id;
    ASSERT_TRUE(part.GetID(id));
    EXPECT_EQ(Text(id), "face-30");
    EXPECT_FALSE(current.GetInstanceEntity(step));

    // An entity that ends in no part is neither kind at the end of its path.
    TarvexEntity const nowhere = model.MakeEntity(TarvexAuthoredEntity{{}, 0, u"x", false});
    EXPECT_FALSE(nowhere.GetPartEntity(part));
    EXPECT_FALSE(nowhere.GetInstanceEntity(step));
    EXPECT_FALSE(TarvexEntity().GetPartEntity(part) || TarvexEntity().GetInstanceEntity(step));
}

// Every unit with its text and length in metres; Unknown, and values outside the table, have
// no text and no length, and every factor to or from them is 1.
TEST(TarvexLengthUnitUtilsTest, GivesEachUnitItsTextAndTheFactorsBetweenThem) {
    std::tuple<int, char const*, double> const units[] = {
        {0, "(none)", 0},  {1, "m", 1},         {2, "cm", 0.01},     {3, "in", 0.0254},
        {4, "mm", 0.001},  {5, "ft", 0.3048},   {6, "um", 0.000001}, {7, "km", 1000},
        {8, "yd", 0.9144}, {9, "mi", 1609.344}, {10, "(none)", 0},   {-1, "(none)", 0}};
    for (auto const& [from, text, fromMetres] : units) {
        auto const unit = [](int value) { return static_cast<TarvexLengthUnitType>(value); };
        EXPECT_EQ(Text(TarvexLengthUnitUtils::LengthUnitToString(unit(from))), text);
        for (auto const& [to, toText, toMetres] : units) {
            double const expected = fromMetres == 0 || toMetres == 0 ? 1 : fromMetres / toMetres;
            EXPECT_NEAR(TarvexLengthUnitUtils::GetScalingFactor(unit(from), unit(to)), expected,
                        expected * 1e-12)
                << from << " to " << to << " (" << toText << ")";
        }
    }
}

} // namespace
