#include "TarvexTestText.h"

#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>

#include <gtest/gtest.h>

#include <functional>
#include <optional>
#include <ostream>
#include <stdexcept>
#include <string>
#include <utility>

namespace {

/// Root instance 1 places the assembly 10 ("Top"), whose instance 2 places the part 20.
TarvexModel MakeModel() {
    TarvexModel model;
    model.AddAssembly(10, u"Top");
    model.AddPart(20, u"Bolt");
    model.AddRootInstance(10, u"Top.1");
    model.AddInstance(10, 20, u"Bolt.1");
    return model;
}

TEST(TarvexEntityTest, DescendsItsInstancePathOneLevelAtATime) {
    TarvexModel const model = MakeModel();
    TarvexEntity const entity = model.MakeEntity({1, 2}, 7);
    EXPECT_EQ(entity.GetEntityId(), 7u);

    TarvexInstanceEntity top;
    ASSERT_TRUE(entity.GetInstanceEntity(top));
    EXPECT_EQ(TextOf(top.GetInstance().GetInstanceName()), u"Top.1");
    EXPECT_EQ(top.GetInstance().GetReference().GetUniqueID(), 10u);
    TarvexEntity const inTop = top.GetEntity();
    EXPECT_EQ(inTop.GetEntityId(), 7u);

    TarvexInstanceEntity bolt;
    ASSERT_TRUE(inTop.GetInstanceEntity(bolt));
    EXPECT_EQ(TextOf(bolt.GetInstance().GetInstanceName()), u"Bolt.1");
    TarvexEntity const inBolt = bolt.GetEntity();
    EXPECT_EQ(inBolt.GetEntityId(), 7u);

    // In the part itself there is no instance left, and the out-argument stays as it was.
    TarvexInstanceEntity kept = top;
    EXPECT_FALSE(inBolt.GetInstanceEntity(kept));
    EXPECT_EQ(TextOf(kept.GetInstance().GetInstanceName()), u"Top.1");
}

TEST(TarvexEntityTest, AnEntityWithoutAModelIsInNoInstance) {
    TarvexInstanceEntity instanceEntity;
    EXPECT_FALSE(TarvexEntity().GetInstanceEntity(instanceEntity));
    EXPECT_EQ(TarvexEntity().GetEntityId(), 0u);
    EXPECT_EQ(TextOf(instanceEntity.GetInstance().GetInstanceName()), std::nullopt);
    EXPECT_EQ(instanceEntity.GetEntity().GetEntityId(), 0u);

    TarvexModel model = MakeModel();
    TarvexModel const moved = std::move(model);
    TarvexEntity const fromMovedFrom = model.MakeEntity({1}, 3);
    EXPECT_FALSE(fromMovedFrom.GetInstanceEntity(instanceEntity));
    EXPECT_EQ(fromMovedFrom.GetEntityId(), 3u);
}

TEST(TarvexPMIAnnotationTest, GivesItsLinkedElementsInOrder) {
    TarvexModel const model = MakeModel();
    TarvexPMIAnnotation const annotation =
        model.MakeAnnotation({model.MakeEntity({}, 4), model.MakeEntity({1, 2}, 5)});
    ASSERT_EQ(annotation.GetLinkedElementsCount(), 2);
    TarvexEntity entity;
    annotation.GetLinkedElement(0, entity);
    EXPECT_EQ(entity.GetEntityId(), 4u);
    TarvexInstanceEntity instanceEntity;
    EXPECT_FALSE(entity.GetInstanceEntity(instanceEntity));
    annotation.GetLinkedElement(1, entity);
    EXPECT_EQ(entity.GetEntityId(), 5u);
    EXPECT_TRUE(entity.GetInstanceEntity(instanceEntity));

    for (int const outOfRange : {-1, 2, 100}) {
        TarvexEntity kept = model.MakeEntity({}, 99);
        annotation.GetLinkedElement(outOfRange, kept);
        EXPECT_EQ(kept.GetEntityId(), 99u) << outOfRange;
    }
    EXPECT_EQ(model.MakeAnnotation({}).GetLinkedElementsCount(), 0);
    EXPECT_EQ(TarvexPMIAnnotation().GetLinkedElementsCount(), 0);
}

TEST(TarvexPMIDataTest, APartsPMIBelongsToItsReference) {
    TarvexModel const model = MakeModel();
    TarvexPartDocument const document =
        model.GetInputProductStructure().GetReferenceFromId(20).GetDocument();
    TarvexPMIData const data = document.GetPMIData();
    EXPECT_TRUE(data.IsValid());
    EXPECT_EQ(data.GetReferenceId(), 20u);
    EXPECT_FALSE(TarvexPartDocument().GetPMIData().IsValid());

    TarvexPartImportResult result;
    EXPECT_FALSE(result.GetPMIData().IsValid()) << "empty until the modeler sets it";
    result.SetPMIData(data);
    EXPECT_TRUE(result.GetPMIData().IsValid());
    EXPECT_EQ(result.GetPMIData().GetReferenceId(), 20u);
}

TEST(TarvexReferenceFromIdTest, FindsReferencesByIdOrAlias) {
    TarvexModel model = MakeModel();
    model.AddPart(30, u"Unplaced");
    model.SetSpoolerIdAlias(20, 2000);
    model.SetSpoolerIdAlias(30, 10); // an alias wins over a reference with the same id
    TarvexInputProductStructure const structure = model.GetInputProductStructure();

    EXPECT_EQ(TextOf(structure.GetReferenceFromId(20).GetReferenceName()), u"Bolt");
    EXPECT_EQ(TextOf(structure.GetReferenceFromId(2000).GetReferenceName()), u"Bolt");
    EXPECT_EQ(TextOf(structure.GetReferenceFromId(10).GetReferenceName()), u"Unplaced");
    EXPECT_EQ(structure.GetReferenceFromId(30).GetUniqueID(), 30u) << "not placed, still known";
    for (int const unknown : {0, 99, -20}) {
        TarvexInputPSReference const reference = structure.GetReferenceFromId(unknown);
        EXPECT_EQ(reference.GetUniqueID(), 0u) << unknown;
        EXPECT_EQ(TextOf(reference.GetReferenceName()), std::nullopt) << unknown;
    }
    EXPECT_EQ(TarvexInputProductStructure().GetReferenceFromId(20).GetUniqueID(), 0u);
}

// Every operation of these value objects asks the model's plan, with subject 0.

struct Handles {
    TarvexModel model = MakeModel();
    TarvexEntity entity = model.MakeEntity({1}, 7);
    TarvexInstanceEntity instanceEntity;
    TarvexPMIAnnotation annotation = model.MakeAnnotation({entity});
    TarvexPartDocument document =
        model.GetInputProductStructure().GetReferenceFromId(20).GetDocument();
    TarvexPartImportResult result;

    Handles() {
        entity.GetInstanceEntity(instanceEntity);
        result.SetPMIData(document.GetPMIData());
    }
};

struct OperationCase {
    char const* operation;
    std::function<void(Handles&)> call;
};

void PrintTo(OperationCase const& c, std::ostream* os) {
    *os << c.operation;
}

class TarvexEntityOperationFaultTest : public ::testing::TestWithParam<OperationCase> {};

TEST_P(TarvexEntityOperationFaultTest, ThrowsWhenPlanned) {
    Handles handles;
    TarvexFault fault;
    fault.operation = GetParam().operation;
    fault.subject = 0;
    fault.what = GetParam().operation;
    handles.model.Faults().Add(fault);
    try {
        GetParam().call(handles);
        ADD_FAILURE() << "no fault thrown";
    } catch (std::runtime_error const& error) {
        EXPECT_STREQ(error.what(), GetParam().operation);
    }
    EXPECT_EQ(handles.model.Faults().GetFiredCount(), 1);
}

INSTANTIATE_TEST_SUITE_P(
    AllOperations, TarvexEntityOperationFaultTest,
    ::testing::Values(OperationCase{"TarvexEntity::GetInstanceEntity",
                                    [](Handles& h) {
                                        TarvexInstanceEntity out;
                                        h.entity.GetInstanceEntity(out);
                                    }},
                      OperationCase{"TarvexEntity::GetEntityId",
                                    [](Handles& h) { h.entity.GetEntityId(); }},
                      OperationCase{"TarvexInstanceEntity::GetInstance",
                                    [](Handles& h) { h.instanceEntity.GetInstance(); }},
                      OperationCase{"TarvexInstanceEntity::GetEntity",
                                    [](Handles& h) { h.instanceEntity.GetEntity(); }},
                      OperationCase{"TarvexPMIAnnotation::GetLinkedElementsCount",
                                    [](Handles& h) { h.annotation.GetLinkedElementsCount(); }},
                      OperationCase{"TarvexPMIAnnotation::GetLinkedElement",
                                    [](Handles& h) {
                                        TarvexEntity out;
                                        h.annotation.GetLinkedElement(0, out);
                                    }},
                      OperationCase{"TarvexPartDocument::GetPMIData",
                                    [](Handles& h) { h.document.GetPMIData(); }},
                      OperationCase{"TarvexPartDocument::GetConvertedPart",
                                    [](Handles& h) { h.document.GetConvertedPart(); }},
                      OperationCase{"TarvexPartImportResult::GetPMIData",
                                    [](Handles& h) { h.result.GetPMIData(); }},
                      OperationCase{"TarvexInputProductStructure::GetReferenceFromId",
                                    [](Handles& h) {
                                        h.model.GetInputProductStructure().GetReferenceFromId(20);
                                    }}),
    [](::testing::TestParamInfo<OperationCase> const& info) {
        std::string name = info.param.operation;
        name.replace(name.find("::"), 2, "_");
        return name;
    });

} // namespace
