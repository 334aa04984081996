#include "support/BuildStructure.h"
#include "support/TestPartContainer.h"
#include "support/VizProductStructureTestPeer.h"
#include <VizBridge/contracts/tarvex/TarvexLengthUnitUtils.h>
#include <VizBridge/model/VizPSEntry.h>

#include <gtest/gtest.h>

#include <optional>

namespace VizBridgeTarvex {
namespace {

/// Product "Prod": P.1 of part 10, A.1 of sub-assembly 20 (Q.1 of part 30, P.2 of part 10),
/// Q.2 of part 30.
TarvexModel makeAssembly() {
    TarvexModel model;
    model.SetProductName(u"Prod");
    model.SetUnits(TarvexLengthUnit_Millimeter);
    model.AddPart(10, u"PartP", u"p.prt");
    model.AddAssembly(20, u"AsmA", u"a.asm");
    model.AddPart(30, u"PartQ", u"q.prt");
    model.AddRootInstance(10, u"P.1");
    model.AddRootInstance(20, u"A.1");
    model.AddInstance(20, 30, u"Q.1");
    model.AddInstance(20, 10, u"P.2");
    model.AddRootInstance(30, u"Q.2");
    TarvexAuthoredDocument& document = model.Document();
    document.fileName = u"prod.asm";
    document.author = u"Ada";
    document.organization = u"Org";
    document.sourceSystem = u"CAD 1";
    document.version = u"v2";
    document.unit = u"millimetre";
    document.comment = u"note";
    document.formatType = u"STEP";
    return model;
}

TEST(MakeVizProductStructure, BuildsTheWholeTreeDepthFirst) {
    auto const s = buildStructure(makeAssembly());

    EXPECT_EQ(s->ToString(), u"Product: Prod\n"
                             u"   Part: instance: P.1 of reference: PartP\n"
                             u"   Product: instance: A.1 of reference: AsmA\n"
                             u"      Part: instance: Q.1 of reference: PartQ\n"
                             u"      Part: instance: P.2 of reference: PartP\n"
                             u"   Part: instance: Q.2 of reference: PartQ\n");
    ASSERT_EQ(s->GetChildren().size(), 3u);
    EXPECT_EQ(s->GetSubAssembly(10), s->GetChildren()[0]) << "the first entry built answers";
    EXPECT_EQ(s->GetSubAssembly(30), s->GetChildren()[1]->GetChildren()[0]);
    EXPECT_EQ(s->GetSubAssembly(99), nullptr);
    for (VizPSEntry const* root : s->GetChildren())
        EXPECT_EQ(root->GetProductStructure(), s.get());
    EXPECT_TRUE(s->IsLoaded(10));
    EXPECT_TRUE(s->IsLoaded(20));
    EXPECT_EQ(s->GetContainerCount(), 3);
    EXPECT_EQ(s->GetConfigurationName(), u"Prod");
    EXPECT_EQ(s->GetUnits(), u"mm");
    EXPECT_TRUE(s->GetErrorMessages().empty());
}

TEST(MakeVizProductStructure, InstancesOfOneReferenceShareItsId) {
    TarvexModel model = makeAssembly();
    model.AddRootInstance(10, u"P.3");
    auto const s = buildStructure(model);
    auto* viz = new VizContainer(10);
    VizProductStructureTestPeer::addVizContainer(*s, 10, viz);

    VizPSEntry const* const p1 = s->GetChildren()[0];
    VizPSEntry const* const p2 = s->GetChildren()[1]->GetChildren()[1];
    VizPSEntry const* const p3 = s->GetChildren()[3];
    EXPECT_EQ(p1->GetInstanceName(), u"P.1");
    EXPECT_EQ(p3->GetInstanceName(), u"P.3");
    for (VizPSEntry const* entry : {p1, p2, p3}) {
        EXPECT_EQ(entry->GetID(), 10);
        EXPECT_EQ(entry->GetVizContainer(), viz);
    }
    EXPECT_EQ(s->GetSubAssembly(10), p1);
}

TEST(MakeVizProductStructure, PartContainerGetterAppliesToPartsOnly) {
    auto const s = buildStructure(makeAssembly());
    VizProductStructureTestPeer::addPartContainer(*s, 20, new TestPartContainer(u"odd", 20));
    VizProductStructureTestPeer::addVizContainer(*s, 20, new VizContainer(20));
    VizPSEntry const* const assembly = s->GetSubAssembly(20);
    EXPECT_EQ(assembly->GetVizPartContainer(), nullptr);
    EXPECT_NE(assembly->GetVizContainer(), nullptr);
}

TEST(MakeVizProductStructure, CopiesTheDocumentStrings) {
    auto const s = buildStructure(makeAssembly());
    EXPECT_EQ(s->GetProductName(), u"Prod");
    EXPECT_EQ(s->GetFileName(), u"prod.asm");
    EXPECT_EQ(s->GetAuthor(), u"Ada");
    EXPECT_EQ(s->GetOrganization(), u"Org");
    EXPECT_EQ(s->GetSourceSystem(), u"CAD 1");
    EXPECT_EQ(s->GetVersion(), u"v2");
    EXPECT_EQ(s->GetDocumentUnits(), u"millimetre");
    EXPECT_EQ(s->GetComment(), u"note");
    EXPECT_EQ(s->GetFormatType(), u"STEP");
}

TEST(MakeVizProductStructure, AnAbsentDocumentStringLeavesOnlyItsFieldEmpty) {
    using Field = std::optional<WString> TarvexAuthoredDocument::*;
    using Getter = WString (VizProductStructure::*)() const;
    struct Case {
        Field field;
        Getter getter;
    };
    Case const cases[] = {
        {&TarvexAuthoredDocument::fileName, &VizProductStructure::GetFileName},
        {&TarvexAuthoredDocument::author, &VizProductStructure::GetAuthor},
        {&TarvexAuthoredDocument::organization, &VizProductStructure::GetOrganization},
        {&TarvexAuthoredDocument::sourceSystem, &VizProductStructure::GetSourceSystem},
        {&TarvexAuthoredDocument::version, &VizProductStructure::GetVersion},
        {&TarvexAuthoredDocument::unit, &VizProductStructure::GetDocumentUnits},
        {&TarvexAuthoredDocument::comment, &VizProductStructure::GetComment},
        {&TarvexAuthoredDocument::formatType, &VizProductStructure::GetFormatType},
    };
    auto const complete = buildStructure(makeAssembly());
    for (Case const& absent : cases) {
        TarvexModel model = makeAssembly();
        model.Document().*absent.field = std::nullopt;
        auto const s = buildStructure(model);
        for (Case const& other : cases) {
            WString const expected =
                other.field == absent.field ? WString() : ((*complete).*other.getter)();
            EXPECT_EQ(((*s).*other.getter)(), expected);
        }
    }
}

TEST(MakeVizProductStructure, AbsentProductNameAndUnknownUnitLeaveTextsEmpty) {
    TarvexModel model = makeAssembly();
    model.SetProductName(std::nullopt);
    model.SetUnits(TarvexLengthUnit_Unknown);
    auto const s = buildStructure(model);
    EXPECT_EQ(s->GetProductName(), u"");
    EXPECT_EQ(s->GetConfigurationName(), u"");
    EXPECT_EQ(s->GetUnits(), u"");
    EXPECT_EQ(s->GetChildren().size(), 3u);
}

struct MissingCase {
    char const* name;
    std::vector<std::optional<WString>> missingFiles;
    std::optional<WString> storage;
    bool missing;
};

class MissingFileMatch : public testing::TestWithParam<MissingCase> {};

TEST_P(MissingFileMatch, MatchesWholeNamesAndPathEndsOnly) {
    MissingCase const& c = GetParam();
    TarvexModel model;
    model.AddPart(5, u"Part", c.storage);
    model.AddRootInstance(5, u"P.1");
    for (auto const& file : c.missingFiles)
        model.AddMissingFile(file);
    auto const s = buildStructure(model);

    WString name = u"untouched";
    EXPECT_EQ(s->IsMissingFile(5, name), c.missing);
    EXPECT_EQ(name, c.missing ? c.storage.value() : WString(u"untouched"));
    EXPECT_TRUE(s->IsLoaded(5)) << "a missing part keeps its entry";
}

INSTANTIATE_TEST_SUITE_P(
    Cases, MissingFileMatch,
    testing::Values(MissingCase{"sameName", {u"p.prt"}, u"p.prt", true},
                    MissingCase{"pathEndingInName", {u"C:/cad/p.prt"}, u"p.prt", true},
                    MissingCase{"fullPathAsStorage", {u"C:/cad/p.prt"}, u"C:/cad/p.prt", true},
                    MissingCase{"nameInTheMiddle", {u"C:/p.prt/x"}, u"p.prt", false},
                    MissingCase{"nameEarlierAndAtEnd", {u"/p.prt/p.prt"}, u"p.prt", false},
                    MissingCase{"longerThanEntry", {u"p.prt"}, u"xp.prt", false},
                    MissingCase{"emptyStorage", {u"p.prt"}, u"", false},
                    MissingCase{"absentStorage", {u"p.prt"}, std::nullopt, false},
                    MissingCase{
                        "emptyEntrySkipped", {u"", std::nullopt, u"d/p.prt"}, u"p.prt", true},
                    MissingCase{"otherFile", {u"q.prt"}, u"p.prt", false}),
    [](testing::TestParamInfo<MissingCase> const& info) { return info.param.name; });

TEST(MakeVizProductStructure, MissingFilesAreListedInTheLibrarysOrder) {
    TarvexModel model = makeAssembly();
    model.AddMissingFile(u"z.prt");
    model.AddMissingFile(u"a.prt");
    auto const s = buildStructure(model);
    EXPECT_EQ(s->GetMissingFiles(), (std::vector<WString>{u"z.prt", u"a.prt"}));
    EXPECT_EQ(s->GetErrorMessages(),
              (std::vector<WString>{u"Missing File z.prt", u"Missing File a.prt"}));
}

TEST(MakeVizProductStructure, EmptySubAssembliesGetNoEntryUnlessMissing) {
    TarvexModel model;
    model.AddAssembly(1, u"EmptyRoot", u"e.asm");
    model.AddAssembly(2, u"Holder", u"h.asm");
    model.AddAssembly(3, u"EmptyChild", u"c.asm");
    model.AddAssembly(4, u"MissingChild", u"m.asm");
    model.AddRootInstance(1, u"E.1");
    model.AddRootInstance(2, u"H.1");
    model.AddInstance(2, 3, u"C.1");
    model.AddInstance(2, 4, u"M.1");
    model.AddRootInstance(77, u"Unknown.1"); // an instance of a reference the model lacks
    model.AddMissingFile(u"/x/m.asm");
    auto s = buildStructure(model);
    EXPECT_EQ(s->ToString(), u"Product: \n"
                             u"   Product: instance: H.1 of reference: Holder\n"
                             u"      Product: instance: M.1 of reference: MissingChild\n");
    EXPECT_FALSE(s->IsLoaded(1));
    EXPECT_FALSE(s->IsLoaded(3));

    model.AddMissingFile(u"e.asm");
    s = buildStructure(model);
    EXPECT_TRUE(s->IsLoaded(1));
    EXPECT_EQ(s->GetChildren().front()->GetInstanceName(), u"E.1");
}

TEST(MakeVizProductStructure, SinglePartFormWithImportedDocument) {
    int const before = TestPartContainer::alive();
    {
        TarvexModel model = makeAssembly();
        auto* part = new TestPartContainer(u"body", 1);
        VizProductStructure* raw = nullptr;
        TarvexDocument document = model.GetDocument();
        VizBuilder::MakeVizProductStructure(model.GetImportResult(),
                                            model.GetInputProductStructure(), document, part, raw);
        std::unique_ptr<VizProductStructure> const s(raw);
        ASSERT_EQ(s->GetChildren().size(), 1u);
        VizPSEntry const* const entry = s->GetChildren()[0];
        EXPECT_EQ(entry->GetID(), 1);
        EXPECT_TRUE(entry->IsPart());
        EXPECT_EQ(entry->GetReferenceName(), u"Prod");
        EXPECT_EQ(entry->GetInstanceName(), u"Prod");
        EXPECT_EQ(entry->GetVizPartContainer(), part);
        EXPECT_EQ(s->GetContainerCount(), 1);
        EXPECT_EQ(s->GetAuthor(), u"Ada");
        EXPECT_EQ(s->GetConfigurationName(), u"Prod");
        EXPECT_EQ(s->GetUnits(), u"mm");
        EXPECT_TRUE(s->GetMissingFiles().empty()) << "the import result is not read";
    }
    EXPECT_EQ(TestPartContainer::alive(), before);
}

TEST(MakeVizProductStructure, SinglePartFormWithHostDocument) {
    VizDocumentInfo info;
    info.productName = u"Host part";
    info.author = u"Me";
    info.comment = u"from the host";
    info.fileName = u"h.prt";
    auto* part = new TestPartContainer(u"body", 1);
    VizProductStructure* raw = nullptr;
    VizBuilder::MakeVizProductStructure(info, part, raw);
    std::unique_ptr<VizProductStructure> const s(raw);
    ASSERT_NE(s, nullptr);
    EXPECT_EQ(s->GetProductName(), u"Host part");
    EXPECT_EQ(s->GetAuthor(), u"Me");
    EXPECT_EQ(s->GetComment(), u"from the host");
    EXPECT_EQ(s->GetFileName(), u"h.prt");
    EXPECT_EQ(s->GetVersion(), u"");
    EXPECT_EQ(s->GetConfigurationName(), u"");
    EXPECT_EQ(s->GetUnits(), u"") << "unit 0 has no text";
    EXPECT_EQ(s->GetSubAssembly(1)->GetInstanceName(), u"Host part");
    EXPECT_EQ(s->GetVizPartContainer(1), part);
    EXPECT_EQ(s->ToString(),
              u"Product: Host part\n   Part: instance: Host part of reference: Host part\n");

    VizProductStructure* none = s.get();
    VizBuilder::MakeVizProductStructure(info, nullptr, none);
    EXPECT_EQ(none, nullptr);
}

} // namespace
} // namespace VizBridgeTarvex
