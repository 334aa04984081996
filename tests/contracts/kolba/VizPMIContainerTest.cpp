#include <VizBridge/contracts/kolba/VizPMIContainer.h>

#include <VizBridge/contracts/kolba/Ray.h>
#include <VizBridge/contracts/kolba/VizContainer.h>

#include <gtest/gtest.h>

#include <memory>

using KolbaVizCore::SemanticPMI;
using KolbaVizCore::VizPMIContainer;
using VizPort::WString;

namespace {

// Records cross the interface as raw pointers whose ownership the container takes.
SemanticPMI* newRecord(WString const& id, WString const& name) {
    auto record = std::make_unique<SemanticPMI>();
    record->ID = id;
    record->Name = name;
    return record.release();
}

} // namespace

TEST(VizPMIContainer, StartsWithoutRecordsAndLeavesOutputsAloneOnAMiss) {
    VizPMIContainer const container(4);
    EXPECT_EQ(container.GetRefID(), 4);
    EXPECT_EQ(container.GetTypeName(), "VizPMIContainer");
    EXPECT_FALSE(container.HasSemanticPMI());
    EXPECT_EQ(container.GetNumberOfSemanticPMI(), 0);

    SemanticPMI sentinel;
    SemanticPMI* found = &sentinel;
    EXPECT_FALSE(container.GetSemanticPMI(u"1", found));
    EXPECT_EQ(found, &sentinel);
    WString text = u"untouched";
    EXPECT_FALSE(container.GetSemanticPMIAsString(u"1", text));
    EXPECT_EQ(text, u"untouched");
}

TEST(VizPMIContainer, FilesRecordsUnderTheirIdAndKeepsThem) {
    VizPMIContainer container(1);
    SemanticPMI* const first = newRecord(u"10", u"Note 1");
    SemanticPMI* const second = newRecord(u"11", u"Dimension 2");
    container.AddSemanticPMI(first);
    container.AddSemanticPMI(second);
    container.AddSemanticPMI(nullptr);

    EXPECT_TRUE(container.HasSemanticPMI());
    EXPECT_EQ(container.GetNumberOfSemanticPMI(), 2);
    SemanticPMI* found = nullptr;
    ASSERT_TRUE(container.GetSemanticPMI(u"11", found));
    EXPECT_EQ(found, second);
    EXPECT_FALSE(container.GetSemanticPMI(u"Note 1", found)) << "filed by ID, not by name";

    WString text;
    ASSERT_TRUE(container.GetSemanticPMIAsString(u"10", text));
    EXPECT_EQ(text, first->ToString());
    EXPECT_EQ(text, u"Name : Note 1\nLabel : \nID : 10\n");
}

// Run under the sanitizer build: a leak of the replaced record or a double free fails there.
TEST(VizPMIContainer, ARecordWithTheSameIdReplacesAndFreesTheOldOne) {
    VizPMIContainer container(1);
    container.AddSemanticPMI(newRecord(u"10", u"old"));
    SemanticPMI* const replacement = newRecord(u"10", u"new");
    container.AddSemanticPMI(replacement);

    EXPECT_EQ(container.GetNumberOfSemanticPMI(), 1);
    SemanticPMI* found = nullptr;
    ASSERT_TRUE(container.GetSemanticPMI(u"10", found));
    EXPECT_EQ(found, replacement);
    EXPECT_EQ(found->Name, u"new");
}

TEST(VizPMIContainer, HandingBackAFiledRecordKeepsItAlive) {
    VizPMIContainer container(1);
    SemanticPMI* const record = newRecord(u"10", u"kept");
    container.AddSemanticPMI(record);
    container.AddSemanticPMI(record);

    SemanticPMI* found = nullptr;
    ASSERT_TRUE(container.GetSemanticPMI(u"10", found));
    EXPECT_EQ(found, record);
    EXPECT_EQ(found->Name, u"kept"); // a use after free under the sanitizers if it was freed
    EXPECT_EQ(container.GetNumberOfSemanticPMI(), 1);
}

TEST(AVizContainer, BaseContainersPickNothing) {
    KolbaVizCore::VizContainer container(3);
    EXPECT_EQ(container.GetTypeName(), "VizContainer");
    EXPECT_EQ(container.GetRefID(), 3);
    EXPECT_EQ(container.GetScaleFactor(), 1.0);

    VizPMIContainer pmiContainer(2);
    KolbaVizCore::AVizContainer* const containers[] = {&container, &pmiContainer};
    for (KolbaVizCore::AVizContainer* const base : containers) {
        KolbaVizCore::VizElement* element = nullptr;
        EXPECT_FALSE(base->PickVisual(nullptr, KolbaVizCore::Ray{}, element));
        EXPECT_EQ(element, nullptr);
    }
}
