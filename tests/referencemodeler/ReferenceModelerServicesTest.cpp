#include <VizBridge/referencemodeler/ReferenceModelerServices.h>
#include <VizBridge/referencemodeler/ReferencePartContainer.h>

#include "support/TestPartContainer.h"
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>

#include <gtest/gtest.h>

#include <limits>
#include <memory>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace VizReferenceModeler {
namespace {

using Failure = ReferenceModelerServices::FailureKind;

constexpr unsigned int ArmId = 2;
constexpr unsigned int PinId = 3;
constexpr unsigned int BoltId = 4;

/// The sub-assembly "Arm" (2) at the root (instance 1), holding the part "Pin" (3)
/// (instance 2) and the part "Bolt" (4) (instance 3). Pin has the faces 101 and 102 and
/// the edge 201, and spans (0, 0, 0) to (2, 1, 3).
TarvexModel MakeModel() {
    TarvexModel model;
    model.SetProductName(u"Frame");
    model.AddAssembly(ArmId, u"Arm");
    TarvexAuthoredPartGeometry& pin = model.AddPart(PinId, u"Pin").geometry;
    pin.faces.push_back({101, {0, 0, 0, 2, 0, 0, 0, 1, 0}, {0, 1, 2}});
    pin.faces.push_back({102, {0, 0, 3, 2, 0, 3, 0, 1, 3}, {0, 1, 2}});
    pin.edges.push_back({201, {0, 0, 0, 0, 0, 3}});
    model.AddPart(BoltId, u"Bolt")
        .geometry.faces.push_back({7, {0, 0, 0, 1, 0, 0, 0, 1, 0}, {0, 1, 2}});
    model.AddRootInstance(ArmId, u"Arm.1");
    model.AddInstance(ArmId, PinId, u"Pin.1");
    model.AddInstance(ArmId, BoltId, u"Bolt.1");
    return model;
}

TarvexPartDocument DocumentOf(TarvexModel const& model, unsigned int referenceId) {
    return model.GetInputProductStructure()
        .GetReferenceFromId(static_cast<int>(referenceId))
        .GetDocument();
}

/// What one ImportPart call gave; owns the container if one came back.
struct Imported {
    bool ok = false;
    std::unique_ptr<VizPartContainer> container;
    TarvexPartImportResult result;
    WString error;

    ReferencePartContainer const* part() const {
        return dynamic_cast<ReferencePartContainer const*>(container.get());
    }
};

Imported Import(ReferenceModelerServices& services, TarvexModel const& model,
                unsigned int referenceId) {
    Imported out;
    TarvexPartDocument document = DocumentOf(model, referenceId);
    VizPartContainer* raw = nullptr;
    int const id = static_cast<int>(referenceId);
    try {
        out.ok = services.ImportPart(id, document, out.result, raw, nullptr, out.error);
    } catch (...) {
        out.container.reset(raw);
        throw;
    }
    out.container.reset(raw);
    return out;
}

TEST(ReferenceModelerImportPart, MakesAContainerOfTheFacesAndEdgesWithThePartsPMI) {
    TarvexModel const model = MakeModel();
    ReferenceModelerServices services;
    EXPECT_EQ(services.GetName(), u"Reference Modeler");

    Imported const imported = Import(services, model, PinId);

    ASSERT_TRUE(imported.ok);
    EXPECT_TRUE(imported.error.empty());
    ASSERT_NE(imported.part(), nullptr);
    ReferencePartContainer const& part = *imported.part();
    EXPECT_EQ(part.GetTypeName(), "Reference BREP Container");
    EXPECT_EQ(part.GetRefID(), static_cast<int>(PinId));
    EXPECT_EQ(part.GetName(), u"Pin");
    EXPECT_TRUE(part.IsModelerDataValid());
    EXPECT_TRUE(part.HasFace(101));
    EXPECT_TRUE(part.HasFace(102));
    EXPECT_TRUE(part.HasEdge(201));
    EXPECT_FALSE(part.HasFace(201)) << "an edge id names no face";
    EXPECT_FALSE(part.HasEdge(101)) << "a face id names no edge";
    EXPECT_FALSE(part.HasFace(7)) << "another part's face";
    ASSERT_NE(part.FindFace(102), nullptr);
    EXPECT_EQ(part.FindFace(102)->positions.size(), 9u);
    ASSERT_NE(part.FindEdge(201), nullptr);
    EXPECT_EQ(part.FindEdge(201)->points.size(), 6u);
    double const low[3] = {0, 0, 0};
    double const high[3] = {2, 1, 3};
    EXPECT_TRUE(part.GetBox() == VizBox(low, high));

    TarvexPMIData const pmi = imported.result.GetPMIData();
    EXPECT_TRUE(pmi.IsValid());
    EXPECT_EQ(pmi.GetReferenceId(), PinId);

    std::vector<ReferenceModelerServices::ImportCall> const calls = services.GetImportCalls();
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(calls[0].referenceId, static_cast<int>(PinId));
    EXPECT_EQ(calls[0].thread, std::this_thread::get_id());
}

TEST(ReferenceModelerImportPart, RecordsTheThreadOfEachCall) {
    TarvexModel const model = MakeModel();
    ReferenceModelerServices services;
    Import(services, model, PinId);
    std::thread::id worker;
    std::thread thread([&] {
        worker = std::this_thread::get_id();
        Import(services, model, BoltId);
    });
    thread.join();

    std::vector<ReferenceModelerServices::ImportCall> const calls = services.GetImportCalls();
    ASSERT_EQ(calls.size(), 2u);
    EXPECT_EQ(calls[0].thread, std::this_thread::get_id());
    EXPECT_EQ(calls[1].referenceId, static_cast<int>(BoltId));
    EXPECT_EQ(calls[1].thread, worker);
    EXPECT_NE(calls[1].thread, calls[0].thread);
}

TEST(ReferenceModelerImportPart, FailsAsPlannedForThePlannedReferenceOnly) {
    TarvexModel const model = MakeModel();
    for (Failure const kind : {Failure::ReturnFalse, Failure::ReturnNullContainer,
                               Failure::ThrowStdException, Failure::ThrowNonStdException}) {
        SCOPED_TRACE(static_cast<int>(kind));
        ReferenceModelerServices services;
        services.PlanFailure(static_cast<int>(PinId), {kind, "disk full"});

        switch (kind) {
        case Failure::ReturnFalse: {
            Imported const imported = Import(services, model, PinId);
            EXPECT_FALSE(imported.ok);
            EXPECT_EQ(imported.container, nullptr);
            EXPECT_EQ(imported.error, u"disk full");
            break;
        }
        case Failure::ReturnNullContainer: {
            Imported const imported = Import(services, model, PinId);
            EXPECT_TRUE(imported.ok);
            EXPECT_EQ(imported.container, nullptr);
            EXPECT_TRUE(imported.error.empty());
            break;
        }
        case Failure::ThrowStdException:
            try {
                Import(services, model, PinId);
                ADD_FAILURE() << "no exception";
            } catch (std::exception const& e) {
                EXPECT_EQ(std::string(e.what()), "disk full");
            }
            break;
        case Failure::ThrowNonStdException:
            try {
                Import(services, model, PinId);
                ADD_FAILURE() << "no exception";
            } catch (std::exception const&) {
                ADD_FAILURE() << "a std::exception";
            } catch (int thrown) {
                EXPECT_EQ(thrown, static_cast<int>(PinId));
            }
            break;
        }

        EXPECT_NE(Import(services, model, BoltId).part(), nullptr) << "an unplanned part";
        services.ClearFailure(static_cast<int>(PinId));
        EXPECT_NE(Import(services, model, PinId).part(), nullptr) << "a cleared plan";
        EXPECT_EQ(services.GetImportCalls().size(), 3u) << "a failing call is recorded too";
    }
}

TEST(ReferenceModelerImportPart, FailsWhenTheDocumentGivesNoPart) {
    TarvexModel model = MakeModel();
    model.FindReference(PinId)->geometry.conversionFails = true;
    ReferenceModelerServices services;

    Imported const failed = Import(services, model, PinId);
    EXPECT_FALSE(failed.ok);
    EXPECT_EQ(failed.container, nullptr);
    EXPECT_EQ(failed.error, u"conversion failed");

    TarvexPartDocument none;
    TarvexPartImportResult result;
    VizPartContainer* container = nullptr;
    WString error;
    EXPECT_FALSE(services.ImportPart(9, none, result, container, nullptr, error));
    EXPECT_EQ(container, nullptr);
    EXPECT_EQ(error, u"no part document");
}

TEST(ReferenceModelerClone, IsAnIndependentCopy) {
    TarvexModel const model = MakeModel();
    ReferenceModelerServices original(u"Host Modeler");
    original.PlanFailure(static_cast<int>(PinId), {Failure::ReturnFalse, "planned"});
    Import(original, model, BoltId);

    std::unique_ptr<VizBridgeTarvex::VizModelerServices> const copy(original.Clone());
    auto& clone = dynamic_cast<ReferenceModelerServices&>(*copy);
    EXPECT_EQ(clone.GetName(), u"Host Modeler");
    EXPECT_EQ(Import(clone, model, PinId).error, u"planned") << "the plan is copied";
    EXPECT_EQ(clone.GetImportCalls().size(), 2u) << "the record is copied";

    clone.ClearFailures();
    EXPECT_NE(Import(clone, model, PinId).part(), nullptr);
    EXPECT_EQ(Import(original, model, PinId).error, u"planned")
        << "clearing the clone's plan leaves the original's";
    EXPECT_EQ(original.GetImportCalls().size(), 2u) << "the clone's calls are its own";
}

/// Pin imported once, for the entity tests.
class ReferenceModelerEntities : public ::testing::Test {
protected:
    TarvexModel model = MakeModel();
    ReferenceModelerServices services;
    Imported pin = Import(services, model, PinId);
    EntityId const untouched{1, 2, 3};
};

TEST_F(ReferenceModelerEntities, GetEntityIdFollowsTheInstancePathDownToThePart) {
    ASSERT_NE(pin.part(), nullptr);
    struct Case {
        std::vector<unsigned int> path;
        unsigned int entityId;
        KolbaVizCore::EntityType type;
    };
    for (Case const& c :
         {Case{{1, 2}, 102, KolbaVizCore::Face}, Case{{1, 2}, 201, KolbaVizCore::Edge},
          Case{{}, 101, KolbaVizCore::Face}}) {
        SCOPED_TRACE(c.entityId);
        TarvexEntity entity = model.MakeEntity(c.path, c.entityId);
        EntityId id = untouched;
        ASSERT_TRUE(services.GetEntityId(pin.container.get(), entity, id));
        EXPECT_TRUE(id == EntityId(PinId, c.type, c.entityId));
    }
}

TEST_F(ReferenceModelerEntities, GetEntityIdAnswersFalseForWhatThePartDoesNotHold) {
    TarvexEntity missing = model.MakeEntity({1, 2}, 999);
    TarvexEntity face = model.MakeEntity({1, 2}, 101);
    VizBridgeTarvex::TestPartContainer foreign(u"Foreign", static_cast<int>(PinId));
    EntityId id = untouched;

    EXPECT_FALSE(services.GetEntityId(pin.container.get(), missing, id));
    EXPECT_FALSE(services.GetEntityId(nullptr, face, id));
    EXPECT_FALSE(services.GetEntityId(&foreign, face, id)) << "another modeler's container";
    EXPECT_TRUE(id == untouched);
}

TEST_F(ReferenceModelerEntities, GetAnnotationEntityIdTakesTheIndexedLinkedElement) {
    TarvexPMIAnnotation annotation =
        model.MakeAnnotation({model.MakeEntity({1, 2}, 999), model.MakeEntity({1, 2}, 201)});
    EntityId id = untouched;

    int index = 1;
    ASSERT_TRUE(services.GetAnnotationEntityId(pin.container.get(), annotation, &index, id));
    EXPECT_TRUE(id == EntityId(PinId, KolbaVizCore::Edge, 201));

    id = untouched;
    for (int bad : {0, 2, -1}) {
        SCOPED_TRACE(bad);
        EXPECT_FALSE(services.GetAnnotationEntityId(pin.container.get(), annotation, &bad, id));
    }
    EXPECT_FALSE(services.GetAnnotationEntityId(pin.container.get(), annotation, nullptr, id));
    EXPECT_TRUE(id == untouched);
}

TEST_F(ReferenceModelerEntities, ConvertToEntityNamesTheFaceEdgeOrBodyOfThePart) {
    // The caller fills the parent id from the body tag of the picked path: Pin's id here.
    struct Case {
        unsigned long id;
        EntityId expected;
    };
    for (Case const& c : {Case{101, EntityId(PinId, KolbaVizCore::Face, 101)},
                          Case{201, EntityId(PinId, KolbaVizCore::Edge, 201)},
                          Case{PinId, EntityId(PinId, KolbaVizCore::Body, PinId)}}) {
        SCOPED_TRACE(c.id);
        EntityId entity(PinId, 0xFFFFFFFFu, static_cast<std::uint32_t>(c.id));
        ASSERT_TRUE(services.ConvertToEntity(c.id, pin.container.get(), entity));
        EXPECT_TRUE(entity == c.expected);
    }
}

TEST_F(ReferenceModelerEntities, ConvertToEntityAnswersFalseForWhatThePartDoesNotHold) {
    EntityId const throughPin(PinId, 0xFFFFFFFFu, 0);
    EntityId const throughBolt(BoltId, 0xFFFFFFFFu, 0);
    struct Case {
        char const* what;
        unsigned long id;
        EntityId entity;
        VizPartContainer* container;
    };
    VizBridgeTarvex::TestPartContainer foreign(u"Foreign", static_cast<int>(PinId));
    std::vector<Case> cases{
        {"no such face", 999, throughPin, pin.container.get()},
        {"a face of Pin on a path through Bolt", 101, throughBolt, pin.container.get()},
        {"Bolt's body id on a path through Pin", BoltId, throughPin, pin.container.get()},
        {"no container", 101, throughPin, nullptr},
        {"another modeler's container", 101, throughPin, &foreign},
    };
    // 101 in the low 32 bits: a truncating lookup would find face 101.
    if (sizeof(unsigned long) > sizeof(unsigned int)) {
        cases.push_back({"a wide id", std::numeric_limits<unsigned int>::max() + 102ul, throughPin,
                         pin.container.get()});
    }
    for (Case const& c : cases) {
        SCOPED_TRACE(c.what);
        EntityId entity = c.entity;
        EXPECT_FALSE(services.ConvertToEntity(c.id, c.container, entity));
        EXPECT_TRUE(entity == c.entity);
    }
}

} // namespace
} // namespace VizReferenceModeler
