#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/import/VizPSInstanceBuilder.h>
#include <VizBridge/model/VizPSEntry.h>

#include <gtest/gtest.h>

#include <array>
#include <memory>
#include <optional>

namespace VizBridgeTarvex {
namespace {

/// One root instance of one part, as the test describes it; makes its entry.
class OneInstance {
public:
    OneInstance() : m_instance(&m_model.AddRootInstance(42, u"inst")) {
        m_model.AddPart(42, u"ref", u"ref.prt");
    }
    TarvexAuthoredInstance& instance() { return *m_instance; }
    TarvexModel& model() { return m_model; }

    std::unique_ptr<VizPSEntry> make() {
        TarvexInputPSInstance const input = m_model.GetInputProductStructure().GetRootInstance(0);
        VizPSEntry* entry = nullptr;
        VizPSInstanceBuilder::MakeVizPSInstance(input, input.GetReference(), entry);
        return std::unique_ptr<VizPSEntry>(entry);
    }

private:
    TarvexModel m_model;
    TarvexAuthoredInstance* m_instance;
};

struct ColorCase {
    char const* name;
    std::optional<std::array<unsigned short, 3>> rgb;
    std::optional<unsigned short> alpha;
    bool hasColor;
    bool hasAlpha;
    RGBAColor color;
};

class VizPSEntryColor : public testing::TestWithParam<ColorCase> {};

TEST_P(VizPSEntryColor, FollowsTheInstanceColourAndAlpha) {
    ColorCase const& c = GetParam();
    OneInstance one;
    one.instance().rgb = c.rgb;
    one.instance().alpha = c.alpha;
    auto const entry = one.make();
    EXPECT_EQ(entry->HasColor(), c.hasColor);
    EXPECT_EQ(entry->HasAlpha(), c.hasAlpha);
    EXPECT_EQ(entry->GetColor(), c.color);
}

RGBAColor const kDefault;
INSTANTIATE_TEST_SUITE_P(
    Cases, VizPSEntryColor,
    testing::Values(ColorCase{"none", std::nullopt, std::nullopt, false, false, kDefault},
                    ColorCase{"rgbOnly", std::array<unsigned short, 3>{10, 20, 30}, std::nullopt,
                              true, false, RGBAColor(10, 20, 30, kDefault.alpha)},
                    ColorCase{"rgbAndOpaqueAlpha", std::array<unsigned short, 3>{1, 2, 3}, 255,
                              true, false, RGBAColor(1, 2, 3, 255)},
                    ColorCase{"rgbAndAlpha", std::array<unsigned short, 3>{1, 2, 3}, 128, true,
                              true, RGBAColor(1, 2, 3, 128)},
                    ColorCase{"alphaOnly", std::nullopt, 64, false, true,
                              RGBAColor(kDefault.red, kDefault.green, kDefault.blue, 64)},
                    ColorCase{"opaqueAlphaOnly", std::nullopt, 255, false, false,
                              RGBAColor(0, 0, 0, 255)},
                    ColorCase{"lowBytesOnly", std::array<unsigned short, 3>{0x1FF, 0x280, 0xFFFF},
                              0x1FF, true, true, RGBAColor(0xFF, 0x80, 0xFF, 0xFF)}),
    [](testing::TestParamInfo<ColorCase> const& info) { return info.param.name; });

TEST(VizPSEntry, TakesNamesIdFlagsAndPlacementFromTheInput) {
    OneInstance one;
    TarvexPlacement placement;
    placement.rotation[0][1] = -1;
    placement.rotation[1][0] = 1;
    placement.rotation[0][0] = placement.rotation[1][1] = 0;
    placement.translation[0] = 5;
    one.instance().placement = placement;
    one.instance().hidden = true;
    one.instance().suppressed = false;

    auto const entry = one.make();
    EXPECT_EQ(entry->GetID(), 42);
    EXPECT_EQ(entry->GetReferenceName(), u"ref");
    EXPECT_EQ(entry->GetInstanceName(), u"inst");
    EXPECT_TRUE(entry->IsPart());
    EXPECT_FALSE(entry->IsSubAssembly());
    EXPECT_TRUE(entry->IsHidden());
    EXPECT_FALSE(entry->IsSuppressed());
    EXPECT_EQ(entry->GetTransformation(), VizTransf(placement.rotation, placement.translation));
    EXPECT_EQ(entry->GetElementType(), "VizPSEntry");
    EXPECT_EQ(entry->GetProductStructure(), nullptr);
    EXPECT_EQ(entry->GetVizContainer(), nullptr);
    EXPECT_EQ(entry->GetVizPartContainer(), nullptr);
}

TEST(VizPSEntry, AbsentValuesGiveEmptyNamesIdentityAndNoFlags) {
    TarvexModel model;
    model.AddPart(3, std::nullopt);
    model.AddRootInstance(3, std::nullopt);
    TarvexInputPSInstance const input = model.GetInputProductStructure().GetRootInstance(0);
    VizPSEntry* raw = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(input, input.GetReference(), raw);
    std::unique_ptr<VizPSEntry> const entry(raw);
    ASSERT_NE(entry, nullptr);
    EXPECT_EQ(entry->GetReferenceName(), u"");
    EXPECT_EQ(entry->GetInstanceName(), u"");
    EXPECT_TRUE(entry->GetTransformation().IsIdentity());
    EXPECT_FALSE(entry->IsHidden());
    EXPECT_FALSE(entry->IsSuppressed());
}

TEST(VizPSEntry, AFailingInputLeavesOutUntouchedAndFreesTheEntry) {
    for (TarvexFaultKind kind : {TarvexFaultKind::StdException, TarvexFaultKind::NonStdException}) {
        OneInstance one;
        TarvexFault fault;
        fault.operation = "TarvexInputPSInstance::GetAlphaColor";
        fault.kind = kind;
        one.model().Faults().Add(fault);
        TarvexInputPSInstance const input =
            one.model().GetInputProductStructure().GetRootInstance(0);
        TarvexInputPSReference const reference = input.GetReference();
        VizPSEntry* out = nullptr;
        EXPECT_ANY_THROW(VizPSInstanceBuilder::MakeVizPSInstance(input, reference, out));
        EXPECT_EQ(out, nullptr) << "LeakSanitizer checks that the half-made entry was freed";
    }
}

TEST(VizPSEntry, NameOverloadMakesAPlainPart) {
    VizPSEntry* raw = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(1, u"Single", raw);
    std::unique_ptr<VizPSEntry> const entry(raw);
    EXPECT_EQ(entry->GetID(), 1);
    EXPECT_EQ(entry->GetReferenceName(), u"Single");
    EXPECT_EQ(entry->GetInstanceName(), u"Single");
    EXPECT_TRUE(entry->IsPart());
    EXPECT_FALSE(entry->HasColor());
    EXPECT_FALSE(entry->HasAlpha());
    EXPECT_TRUE(entry->GetTransformation().IsIdentity());
}

TEST(VizPSEntry, ToStringIndentsThreeBlanksPerLevel) {
    VizPSEntry* part = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(1, u"P", part);
    std::unique_ptr<VizPSEntry> const owned(part);
    EXPECT_EQ(part->ToString(0), u"Part: instance: P of reference: P\n");
    EXPECT_EQ(part->ToString(2), u"      Part: instance: P of reference: P\n");

    TarvexModel model;
    model.AddAssembly(5, u"Asm");
    model.AddRootInstance(5, u"A.1");
    model.AddPart(6, u"Leaf");
    model.AddInstance(5, 6, u"L.1");
    TarvexInputPSInstance const input = model.GetInputProductStructure().GetRootInstance(0);
    VizPSEntry* assembly = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(input, input.GetReference(), assembly);
    std::unique_ptr<VizPSEntry> const ownedAssembly(assembly);
    assembly->AddChild(part);
    assembly->AddChild(nullptr); // stored as given, printed as nothing
    EXPECT_EQ(assembly->GetNumberOfChildren(), 2);
    EXPECT_EQ(assembly->ToString(1), u"   Product: instance: A.1 of reference: Asm\n"
                                     u"      Part: instance: P of reference: P\n");
}

} // namespace
} // namespace VizBridgeTarvex
