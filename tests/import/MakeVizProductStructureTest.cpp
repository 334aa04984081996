#include "support/BuildStructure.h"
#include "support/TestPartContainer.h"
#include "support/VizProductStructureTestPeer.h"
#include <VizBridge/contracts/tarvex/TarvexLengthUnitUtils.h>
#include <VizBridge/model/VizPSEntry.h>

#include <gtest/gtest.h>

#include <iterator>
#include <optional>

namespace VizBridgeTarvex {
namespace {

using Peer = VizProductStructureTestPeer;

TEST(MakeVizProductStructure, BuildsTheWholeTreeDepthFirst) {
    SharedProduct product;
    product.model.AddMissingFile(u"z.prt"); // listed in the import library's order
    product.model.AddMissingFile(u"a.prt");
    auto const s = buildStructure(product.model);

    EXPECT_EQ(s->ToString(), u"Product: Prod\n"
                             u"   Part: instance: P.1 of reference: PartP\n"
                             u"   Product: instance: A.1 of reference: Asm\n"
                             u"      Part: instance: Q.1 of reference: PartQ\n"
                             u"      Product: instance: B.1 of reference: Sub\n"
                             u"         Part: instance: P.2 of reference: PartP\n"
                             u"   Part: instance: M.1 of reference: PartM\n");
    VizPSEntry const* const p2 = s->GetChildren()[1]->GetChildren()[1]->GetChildren()[0];
    EXPECT_EQ(s->GetSubAssembly(10), s->GetChildren()[0]) << "the first entry built answers";
    EXPECT_EQ(p2->GetID(), 10) << "the instances of a reference share its id";
    EXPECT_EQ(p2->GetProductStructure(), s.get());
    EXPECT_FALSE(s->IsLoaded(20)) << "an empty sub-assembly gets no entry";
    EXPECT_EQ(s->GetErrorMessages(),
              (std::vector<WString>{u"Missing File z.prt", u"Missing File a.prt"}));

    // Every instance finds its reference's containers; only parts find a part container.
    auto* viz = new VizContainer(10);
    Peer::addVizContainer(*s, 10, viz);
    EXPECT_EQ(p2->GetVizContainer(), viz);
    Peer::addPartContainer(*s, 30, new TestPartContainer(u"odd", 30));
    EXPECT_EQ(s->GetSubAssembly(30)->GetVizPartContainer(), nullptr);
}

/// The document strings, the configuration name and the unit, in the getters' order.
WString documentStrings(VizProductStructure const& s) {
    return s.GetFileName() + u"|" + s.GetAuthor() + u"|" + s.GetOrganization() + u"|" +
           s.GetSourceSystem() + u"|" + s.GetVersion() + u"|" + s.GetDocumentUnits() + u"|" +
           s.GetComment() + u"|" + s.GetFormatType() + u"|" + s.GetProductName() + u"|" +
           s.GetConfigurationName() + u"|" + s.GetUnits();
}

// Each round leaves every other string absent; the second also the name and the unit.
TEST(MakeVizProductStructure, CopiesTheDocumentStringsAndLeavesAbsentOnesEmpty) {
    SharedProduct first;
    first.model.Document() = {u"prod.asm", {}, u"Org", {}, u"v2", {}, u"note", {}};
    first.model.SetUnits(TarvexLengthUnit_Millimeter);
    EXPECT_EQ(documentStrings(*buildStructure(first.model)),
              u"prod.asm||Org||v2||note||Prod|Prod|mm");

    SharedProduct second;
    second.model.Document() = {{}, u"Ada", {}, u"CAD 1", {}, u"millimetre", {}, u"STEP"};
    second.model.SetProductName(std::nullopt);
    second.model.SetUnits(TarvexLengthUnit_Unknown);
    EXPECT_EQ(documentStrings(*buildStructure(second.model)), u"|Ada||CAD 1||millimetre||STEP|||");
}

TEST(MakeVizProductStructure, MissingFilesMatchWholeNamesAndPathEndsOnly) {
    struct Case {
        std::vector<std::optional<WString>> missingFiles;
        std::optional<WString> storage;
        bool missing;
    };
    Case const cases[] = {
        {{u"p.prt"}, u"p.prt", true},
        {{u"C:/cad/p.prt"}, u"p.prt", true},
        {{u"C:/p.prt/x"}, u"p.prt", false},
        {{u"/p.prt/p.prt"}, u"p.prt", false}, // the name also stands earlier
        {{u"p.prt"}, u"xp.prt", false},
        {{u"p.prt"}, std::nullopt, false},
        {{u"", std::nullopt, u"d/p.prt"}, u"p.prt", true}, // empty entries are skipped
    };
    for (Case const& c : cases) {
        SCOPED_TRACE(&c - cases);
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
}

TEST(MakeVizProductStructure, EmptySubAssembliesGetAnEntryOnlyWhenMissing) {
    TarvexModel model;
    model.AddAssembly(1, u"MissingRoot", u"e.asm");
    model.AddAssembly(2, u"Holder", u"h.asm");
    model.AddAssembly(3, u"EmptyChild", u"c.asm");
    model.AddAssembly(4, u"MissingChild", u"m.asm");
    model.AddRootInstance(1, u"E.1");
    model.AddRootInstance(2, u"H.1");
    model.AddInstance(2, 3, u"C.1");
    model.AddInstance(2, 4, u"M.1");
    model.AddMissingFile(u"/x/m.asm");
    model.AddMissingFile(u"e.asm");
    auto const s = buildStructure(model);
    EXPECT_EQ(s->ToString(), u"Product: \n"
                             u"   Product: instance: E.1 of reference: MissingRoot\n"
                             u"   Product: instance: H.1 of reference: Holder\n"
                             u"      Product: instance: M.1 of reference: MissingChild\n");
    EXPECT_FALSE(s->IsLoaded(3));
}

// The forms around a part container that the host has: with the import library's document
// strings, or with the host's own.
TEST(MakeVizProductStructure, SinglePartForms) {
    int const before = TestPartContainer::alive();
    {
        SharedProduct product;
        product.model.SetUnits(TarvexLengthUnit_Millimeter);
        product.model.Document().author = u"Ada";
        product.model.AddMissingFile(u"p.prt");
        auto* part = new TestPartContainer(u"body", 1);
        VizProductStructure* raw = nullptr;
        TarvexDocument document = product.model.GetDocument();
        VizBuilder::MakeVizProductStructure(product.model.GetImportResult(),
                                            product.model.GetInputProductStructure(), document,
                                            part, raw);
        std::unique_ptr<VizProductStructure> const s(raw);
        EXPECT_EQ(s->ToString(), u"Product: Prod\n   Part: instance: Prod of reference: Prod\n");
        EXPECT_EQ(s->GetSubAssembly(1)->GetVizPartContainer(), part);
        EXPECT_EQ(s->GetContainerCount(), 1);
        EXPECT_EQ(documentStrings(*s), u"|Ada|||||||Prod|Prod|mm");
        EXPECT_TRUE(s->GetMissingFiles().empty()) << "the import result is not read";
    }
    EXPECT_EQ(TestPartContainer::alive(), before) << "the structure owned the container";

    VizDocumentInfo info;
    info.productName = u"Host part";
    info.author = u"Me";
    auto* part = new TestPartContainer(u"body", 1);
    VizProductStructure* raw = nullptr;
    VizBuilder::MakeVizProductStructure(info, part, raw);
    std::unique_ptr<VizProductStructure> const s(raw);
    EXPECT_EQ(s->ToString(),
              u"Product: Host part\n   Part: instance: Host part of reference: Host part\n");
    EXPECT_EQ(s->GetSubAssembly(1)->GetVizPartContainer(), part);
    EXPECT_EQ(documentStrings(*s), u"|Me|||||||Host part||") << "unit 0 has no text";
    VizProductStructure* none = s.get();
    VizBuilder::MakeVizProductStructure(info, nullptr, none);
    EXPECT_EQ(none, nullptr);
}

} // namespace
} // namespace VizBridgeTarvex
