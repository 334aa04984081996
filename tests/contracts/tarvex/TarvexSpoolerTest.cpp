#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcessSpooler.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <ostream>
#include <set>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace {

using ::testing::ElementsAre;
using ::testing::UnorderedElementsAre;

struct Delivery {
    unsigned int id = 0;
    TarvexRep representation = TarvexRep_None;
    bool operator==(Delivery const&) const = default;
};

void PrintTo(Delivery const& delivery, std::ostream* os) {
    *os << delivery.id << " as " << delivery.representation;
}

std::vector<unsigned int> IdsOf(std::vector<Delivery> const& deliveries) {
    std::vector<unsigned int> ids;
    for (Delivery const& delivery : deliveries) {
        ids.push_back(delivery.id);
    }
    return ids;
}

/// Polls the spooler as a host does until it completes. A spooler that does not complete
/// within a minute fails the test instead of hanging it.
std::vector<Delivery> Drain(TarvexMultiProcessSpooler& spooler) {
    std::vector<Delivery> deliveries;
    auto const deadline = std::chrono::steady_clock::now() + std::chrono::minutes(1);
    while (!spooler.IsComplete()) {
        if (std::chrono::steady_clock::now() > deadline) {
            ADD_FAILURE() << "the spooler did not complete";
            break;
        }
        unsigned int id = 0;
        if (spooler.HasDataAvailableFor(id)) {
            deliveries.push_back(Delivery{id, spooler.GetActiveRepresentation()});
        } else {
            std::this_thread::sleep_for(std::chrono::milliseconds(1));
        }
    }
    unsigned int id = 0;
    EXPECT_FALSE(spooler.HasDataAvailableFor(id)) << "nothing after completion";
    return deliveries;
}

/// Root: assembly 1 { part 10, part 20, assembly 2 { part 30, part 20 }, part 20,
/// undefined 99 }, part 40, assembly 1 again. Depth first, the parts come as 10, 20, 30, 40.
TarvexModel MakeProduct() {
    TarvexModel model;
    model.AddAssembly(1, u"Top");
    model.AddAssembly(2, u"Sub");
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        model.AddPart(id, u"Part")
            .geometry.faces.push_back({id, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 2}});
    }
    model.AddRootInstance(1, u"Top.1");
    model.AddInstance(1, 10, u"10.1");
    model.AddInstance(1, 20, u"20.1");
    model.AddInstance(1, 2, u"Sub.1");
    model.AddInstance(2, 30, u"30.1");
    model.AddInstance(2, 20, u"20.2");
    model.AddInstance(1, 20, u"20.3");
    model.AddInstance(1, 99, u"undefined");
    model.AddRootInstance(40, u"40.1");
    model.AddRootInstance(1, u"Top.2");
    return model;
}

std::vector<Delivery> Spool(TarvexModel const& model) {
    TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
    EXPECT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
    return Drain(spooler);
}

TEST(TarvexSpoolerTest, DeliversEveryUniquePartOnceAndNoSubAssembly) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    TarvexModel const model = MakeProduct();
    std::vector<Delivery> const deliveries = Spool(model);
    EXPECT_THAT(deliveries,
                UnorderedElementsAre(Delivery{10, TarvexRep_BREP}, Delivery{20, TarvexRep_BREP},
                                     Delivery{30, TarvexRep_BREP}, Delivery{40, TarvexRep_BREP}));
}

TEST(TarvexSpoolerTest, ConvertsOnWorkerThreadsAheadOfTheHost) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    TarvexModel const model = MakeProduct();
    Spool(model);
    std::set<std::thread::id> workers;
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        EXPECT_EQ(model.GetConversionCount(id), 1) << id;
        std::optional<std::thread::id> const thread = model.GetConversionThread(id);
        ASSERT_TRUE(thread.has_value()) << id;
        EXPECT_NE(*thread, std::this_thread::get_id()) << id;
        workers.insert(*thread);

        // The host's later request is answered from what the worker converted.
        auto const part = model.GetInputProductStructure()
                              .GetReferenceFromId(static_cast<int>(id))
                              .GetDocument()
                              .GetConvertedPart();
        ASSERT_NE(part, nullptr);
        EXPECT_EQ(part->faces.at(0).entityId, id);
        EXPECT_EQ(model.GetConversionCount(id), 1) << id;
    }
    EXPECT_LE(workers.size(), 2u);
    EXPECT_EQ(model.GetConversionCount(1), 0) << "a sub-assembly is not converted";
    EXPECT_EQ(model.GetConversionCount(99), 0);
}

struct WorkerCountCase {
    int toUse;
    std::optional<int> physical;
    std::size_t atMost;
};

void PrintTo(WorkerCountCase const& c, std::ostream* os) {
    *os << "to use " << c.toUse << ", physical " << (c.physical ? *c.physical : -1);
}

class TarvexSpoolerWorkerCountTest : public ::testing::TestWithParam<WorkerCountCase> {};

TEST_P(TarvexSpoolerWorkerCountTest, UsesNoMoreWorkersThanAllowed) {
    TarvexScopedProcessors const processors(GetParam().toUse, GetParam().physical);
    TarvexModel const model = MakeProduct();
    EXPECT_EQ(Spool(model).size(), 4u);
    std::set<std::thread::id> workers;
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        workers.insert(model.GetConversionThread(id).value());
    }
    EXPECT_LE(workers.size(), GetParam().atMost);
    EXPECT_EQ(workers.count(std::this_thread::get_id()), 0u);
}

// 0 to use means every physical processor; never more workers than parts (4).
INSTANTIATE_TEST_SUITE_P(Cases, TarvexSpoolerWorkerCountTest,
                         ::testing::Values(WorkerCountCase{1, 8, 1}, WorkerCountCase{0, 1, 1},
                                           WorkerCountCase{0, 3, 3}, WorkerCountCase{3, 1, 3},
                                           WorkerCountCase{16, std::nullopt, 4},
                                           WorkerCountCase{0, 64, 4}));

TEST(TarvexSpoolerTest, OneWorkerDeliversInTheOrderOfTheWalk) {
    TarvexScopedProcessors const processors(1, std::nullopt);
    TarvexModel model = MakeProduct();
    // The first part is the slowest: with one worker the others still wait for it.
    model.FindReference(10)->geometry.conversionCostMicroseconds = 30000;
    EXPECT_THAT(IdsOf(Spool(model)), ElementsAre(10, 20, 30, 40));
}

TEST(TarvexSpoolerTest, DeliversInTheOrderConversionsFinishNotInTheOrderOfTheWalk) {
    TarvexScopedProcessors const processors(1, std::nullopt);
    TarvexModel model = MakeProduct();
    model.FindReference(10)->geometry.conversionCostMicroseconds = 30000;
    // The host converts the last part of the walk before the spooler starts: its conversion
    // finished first, so it comes first, and it is not converted again.
    ASSERT_NE(
        model.GetInputProductStructure().GetReferenceFromId(40).GetDocument().GetConvertedPart(),
        nullptr);
    EXPECT_THAT(IdsOf(Spool(model)), ElementsAre(40, 10, 20, 30));
    EXPECT_EQ(model.GetConversionCount(40), 1);
    EXPECT_EQ(model.GetConversionThread(40), std::this_thread::get_id());
}

TEST(TarvexSpoolerTest, HonoursTheModelsDeliveryOrder) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    TarvexModel model = MakeProduct();
    // 40 is slow and listed first: the parts after it wait for it although they finish
    // earlier. Ids of no part of the product, repeats and sub-assemblies are passed over.
    model.FindReference(40)->geometry.conversionCostMicroseconds = 30000;
    model.SetSpoolerDeliveryOrder({40, 777, 30, 40, 2, 99});
    std::vector<unsigned int> const ids = IdsOf(Spool(model));
    ASSERT_EQ(ids.size(), 4u);
    EXPECT_THAT(std::vector<unsigned int>(ids.begin(), ids.begin() + 2), ElementsAre(40, 30));
    EXPECT_THAT(std::vector<unsigned int>(ids.begin() + 2, ids.end()),
                UnorderedElementsAre(10, 20));
}

TEST(TarvexSpoolerTest, DeliversAnAliasInPlaceOfItsReference) {
    TarvexScopedProcessors const processors(1, std::nullopt);
    TarvexModel model = MakeProduct();
    model.SetSpoolerIdAlias(20, 2020);
    EXPECT_THAT(IdsOf(Spool(model)), ElementsAre(10, 2020, 30, 40));
    TarvexInputProductStructure const structure = model.GetInputProductStructure();
    EXPECT_EQ(structure.GetReferenceFromId(2020).GetUniqueID(), 20u)
        << "the delivered id leads to the reference, whose own id differs";
    EXPECT_EQ(structure.GetReferenceFromId(20).GetUniqueID(), 20u);
}

TEST(TarvexSpoolerTest, DeliversAFailedConversionAsNoRepresentation) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    TarvexModel model = MakeProduct();
    model.FindReference(30)->geometry.conversionFails = true;
    EXPECT_THAT(Spool(model),
                UnorderedElementsAre(Delivery{10, TarvexRep_BREP}, Delivery{20, TarvexRep_BREP},
                                     Delivery{30, TarvexRep_None}, Delivery{40, TarvexRep_BREP}));
    EXPECT_EQ(
        model.GetInputProductStructure().GetReferenceFromId(30).GetDocument().GetConvertedPart(),
        nullptr);
    EXPECT_EQ(model.GetConversionCount(30), 1) << "a failed conversion is not tried again";
}

TEST(TarvexSpoolerTest, CompletesAtOnceWhenThereIsNothingToConvert) {
    TarvexModel onlyAssemblies;
    onlyAssemblies.AddAssembly(1, u"Empty");
    onlyAssemblies.AddRootInstance(1, u"Empty.1");
    onlyAssemblies.AddRootInstance(99, u"undefined");
    TarvexModel noRoots;
    noRoots.AddPart(10, u"Unplaced");

    for (TarvexInputProductStructure const& input :
         {onlyAssemblies.GetInputProductStructure(), noRoots.GetInputProductStructure(),
          TarvexInputProductStructure()}) {
        TarvexMultiProcessSpooler spooler(input);
        EXPECT_TRUE(spooler.IsComplete()) << "nothing started yet";
        EXPECT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
        EXPECT_TRUE(spooler.IsComplete());
        unsigned int id = 5;
        EXPECT_FALSE(spooler.HasDataAvailableFor(id));
        EXPECT_EQ(id, 5u);
        EXPECT_EQ(spooler.GetActiveRepresentation(), TarvexRep_None);
    }
    EXPECT_EQ(noRoots.GetConversionCount(10), 0);
}

TEST(TarvexSpoolerTest, IsCompleteOnlyOnceEveryPartWasHandedOver) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    TarvexModel const model = MakeProduct();
    TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
    EXPECT_TRUE(spooler.IsComplete());
    EXPECT_EQ(spooler.GetActiveRepresentation(), TarvexRep_None);
    ASSERT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
    // Converting is not enough: the parts must be handed over.
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        model.GetInputProductStructure()
            .GetReferenceFromId(static_cast<int>(id))
            .GetDocument()
            .GetConvertedPart();
    }
    EXPECT_FALSE(spooler.IsComplete());
    EXPECT_EQ(Drain(spooler).size(), 4u);
    EXPECT_TRUE(spooler.IsComplete());
}

TEST(TarvexSpoolerTest, StartsOnlyOnceAndOnlyForTheModelerReadyForm) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    TarvexModel const model = MakeProduct();
    TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
    EXPECT_FALSE(spooler.InitiateConversion(TarvexRep_Visualization));
    EXPECT_FALSE(spooler.InitiateConversion(TarvexRep_None));
    EXPECT_TRUE(spooler.IsComplete()) << "nothing was started";
    EXPECT_EQ(model.GetConversionCount(10), 0);

    EXPECT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
    EXPECT_FALSE(spooler.InitiateConversion(TarvexRep_BREP)) << "while it runs";
    EXPECT_EQ(Drain(spooler).size(), 4u);
    EXPECT_FALSE(spooler.InitiateConversion(TarvexRep_BREP)) << "after it finished";
    EXPECT_TRUE(spooler.IsComplete());
}

TEST(TarvexSpoolerTest, StopsItsWorkersWhenDestroyedMidConversion) {
    TarvexScopedProcessors const processors(1, std::nullopt);
    TarvexModel model = MakeProduct();
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        model.FindReference(id)->geometry.conversionCostMicroseconds = 20000;
    }
    {
        TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
        ASSERT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
        auto const deadline = std::chrono::steady_clock::now() + std::chrono::minutes(1);
        while (model.GetConversionCount(10) == 0 && std::chrono::steady_clock::now() < deadline) {
            std::this_thread::sleep_for(std::chrono::milliseconds(1));
        }
        ASSERT_EQ(model.GetConversionCount(10), 1);
        // Goes away with a conversion under way and nothing handed over.
    }
    // The conversion that was under way finished and is kept; whatever ran, ran once.
    EXPECT_NE(
        model.GetInputProductStructure().GetReferenceFromId(10).GetDocument().GetConvertedPart(),
        nullptr);
    for (unsigned int const id : {10u, 20u, 30u, 40u}) {
        EXPECT_LE(model.GetConversionCount(id), 1) << id;
    }
}

TEST(TarvexSpoolerTest, KeepsTheModelDataAliveWhileItsWorkersRun) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    auto model = std::make_unique<TarvexModel>(MakeProduct());
    model->FindReference(10)->geometry.conversionCostMicroseconds = 10000;
    TarvexMultiProcessSpooler spooler(model->GetInputProductStructure());
    ASSERT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
    model.reset();
    EXPECT_THAT(IdsOf(Drain(spooler)), UnorderedElementsAre(10, 20, 30, 40));
}

// Every operation of the spooler asks the model's plan, with subject 0.

struct SpoolerOperationCase {
    char const* operation;
    std::function<void(TarvexInputProductStructure const&)> call;
};

void PrintTo(SpoolerOperationCase const& c, std::ostream* os) {
    *os << c.operation;
}

class TarvexSpoolerFaultTest : public ::testing::TestWithParam<SpoolerOperationCase> {};

TEST_P(TarvexSpoolerFaultTest, ThrowsWhenPlanned) {
    TarvexModel model = MakeProduct();
    TarvexFault fault;
    fault.operation = GetParam().operation;
    fault.subject = 0;
    fault.what = GetParam().operation;
    model.Faults().Add(fault);
    try {
        GetParam().call(model.GetInputProductStructure());
        ADD_FAILURE() << "no fault thrown";
    } catch (std::runtime_error const& error) {
        EXPECT_STREQ(error.what(), GetParam().operation);
    }
    EXPECT_EQ(model.Faults().GetFiredCount(), 1);
}

INSTANTIATE_TEST_SUITE_P(
    AllOperations, TarvexSpoolerFaultTest,
    ::testing::Values(SpoolerOperationCase{"TarvexMultiProcessSpooler::TarvexMultiProcessSpooler",
                                           [](TarvexInputProductStructure const& input) {
                                               TarvexMultiProcessSpooler const spooler(input);
                                           }},
                      SpoolerOperationCase{"TarvexMultiProcessSpooler::InitiateConversion",
                                           [](TarvexInputProductStructure const& input) {
                                               TarvexMultiProcessSpooler spooler(input);
                                               spooler.InitiateConversion(TarvexRep_BREP);
                                           }},
                      SpoolerOperationCase{"TarvexMultiProcessSpooler::IsComplete",
                                           [](TarvexInputProductStructure const& input) {
                                               TarvexMultiProcessSpooler const spooler(input);
                                               spooler.IsComplete();
                                           }},
                      SpoolerOperationCase{"TarvexMultiProcessSpooler::HasDataAvailableFor",
                                           [](TarvexInputProductStructure const& input) {
                                               TarvexMultiProcessSpooler const spooler(input);
                                               unsigned int id = 0;
                                               spooler.HasDataAvailableFor(id);
                                           }},
                      SpoolerOperationCase{"TarvexMultiProcessSpooler::GetActiveRepresentation",
                                           [](TarvexInputProductStructure const& input) {
                                               TarvexMultiProcessSpooler const spooler(input);
                                               spooler.GetActiveRepresentation();
                                           }}),
    [](::testing::TestParamInfo<SpoolerOperationCase> const& info) {
        std::string name = info.param.operation;
        return name.substr(name.find("::") + 2);
    });

TEST(TarvexSpoolerTest, AFaultedPollLosesNoPart) {
    TarvexScopedProcessors const processors(2, std::nullopt);
    TarvexModel model = MakeProduct();
    TarvexFault fault;
    fault.operation = "TarvexMultiProcessSpooler::HasDataAvailableFor";
    fault.skip = 1;
    fault.times = 2;
    model.Faults().Add(fault);
    TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
    ASSERT_TRUE(spooler.InitiateConversion(TarvexRep_BREP));
    unsigned int id = 0;
    spooler.HasDataAvailableFor(id);
    EXPECT_THROW(spooler.HasDataAvailableFor(id), std::runtime_error);
    EXPECT_THROW(spooler.HasDataAvailableFor(id), std::runtime_error);
    std::vector<unsigned int> ids = IdsOf(Drain(spooler));
    if (id != 0) {
        ids.push_back(id); // the first poll may have handed one over already
    }
    EXPECT_THAT(ids, UnorderedElementsAre(10, 20, 30, 40));
}

TEST(TarvexSpoolerTest, AFaultedStartStartsNothing) {
    TarvexModel model = MakeProduct();
    TarvexFault fault;
    fault.operation = "TarvexMultiProcessSpooler::InitiateConversion";
    fault.times = 1;
    model.Faults().Add(fault);
    TarvexMultiProcessSpooler spooler(model.GetInputProductStructure());
    EXPECT_THROW(spooler.InitiateConversion(TarvexRep_BREP), std::runtime_error);
    EXPECT_TRUE(spooler.IsComplete());
    EXPECT_TRUE(spooler.InitiateConversion(TarvexRep_BREP)) << "it may be started afterwards";
    EXPECT_EQ(Drain(spooler).size(), 4u);
}

} // namespace
