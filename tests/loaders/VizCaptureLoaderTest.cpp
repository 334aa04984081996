#include "ImportedVisu.h"
#include "LoaderTestSupport.h"

#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuView.h>
#include <VizBridge/contracts/tarvex/TarvexVisuCapture.h>
#include <VizBridge/loaders/VizCaptureLoader.h>

#include <gtest/gtest.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace {

using namespace LoaderTest;
using KolbaVizCore::VizCapture;
using Members = std::vector<VizPort::WString>;

/// The first capture of an import of `visu`, loaded.
std::unique_ptr<VizCapture> LoadFirst(ImportedVisu const& visu) {
    TarvexVisuCapture const source = Items(visu.test.Import().GetCaptureIterator()).at(0);
    VizBridgeTarvex::VizCaptureLoader loader(source, nullptr, false);
    return LoadAs<VizCapture>(loader);
}

TEST(VizCaptureLoaderTest, FillsStatesNamesPlaneAndMembersAnnotationsFirst) {
    ImportedVisu visu;
    TarvexAuthoredVisuCapture& record = visu.test.Visu().captures.emplace_back();
    record.hidden = true;
    record.active = true;
    record.displayName = u"Capture 1";
    record.id = u"c-1";
    record.mechanicalId = u"cm-1";
    record.hiddenText = u"shown while hidden";
    record.clippingPlane = TarvexVisuTriples{{{1, 2, 3}, {0, 0, 1}, {1, 0, 0}}};
    record.annotationIds = {u"a1", u"a2"};
    record.ftaConstructedGeometryIds = {u"cg1"};
    record.managesGeometry = true;
    record.bodies = {{{}, 0, u"body-1", true}};
    std::unique_ptr<VizCapture> const capture = LoadFirst(visu);
    ASSERT_TRUE(capture);
    EXPECT_TRUE(capture->GetHidden());
    EXPECT_TRUE(capture->GetActive());
    EXPECT_EQ(capture->GetName(), u"Capture 1");
    EXPECT_EQ(capture->GetVisualID(), u"c-1");
    EXPECT_EQ(capture->GetMechanicalID(), u"cm-1");
    EXPECT_EQ(capture->GetHiddenText(), u"shown while hidden");
    float origin[3], normal[3], first[3];
    ASSERT_TRUE(capture->GetClippingPlane(origin, normal, first));
    EXPECT_EQ(std::vector<float>(first, first + 3), (std::vector<float>{1, 0, 0}));
    EXPECT_EQ(capture->GetMembers(), (Members{u"a1", u"a2", u"cg1", u"body-1"}));

    record.managesGeometry = false;
    std::unique_ptr<VizCapture> const unmanaged = LoadFirst(visu);
    ASSERT_TRUE(unmanaged);
    EXPECT_EQ(unmanaged->GetMembers(), (Members{u"a1", u"a2", u"cg1"}));
}

TEST(VizCaptureLoaderTest, TakesTheAngleOrZoomOfItsCameraTypeOnlyWithAnOrientation) {
    using Camera = TarvexVisuCamera;
    TarvexVisuTriples const orientation{{{0, 0, 10}, {0, 0, 0}, {0, 1, 0}}};
    struct {
        Camera::TarvexVisuCameraType given;
        bool oriented;
        VizCapture::CameraType type;
        float angle, zoom;
    } const cases[] = {
        {Camera::CameraPerspective, true, VizCapture::PerspectiveCamera, 30, 1},
        {Camera::CameraOrthographic, true, VizCapture::OrthographicCamera, 0, 4},
        {Camera::CameraPerspective, false, VizCapture::PerspectiveCamera, 0, 1},
        {Camera::TarvexVisuCameraType(7), true, VizCapture::UndefinedCamera, 0, 1},
    };
    for (auto const& c : cases) {
        SCOPED_TRACE(::testing::Message() << "camera type " << c.given << ", " << c.oriented);
        TarvexAuthoredVisuCapture record;
        record.camera = {c.given, c.oriented ? std::optional(orientation) : std::nullopt, 30, 4};
        TarvexVisuCapture const source = Make<TarvexVisuCapture>(record);
        VizBridgeTarvex::VizCaptureLoader loader(source, nullptr, false);
        std::unique_ptr<VizCapture> const capture = LoadAs<VizCapture>(loader);
        ASSERT_TRUE(capture);
        EXPECT_EQ(capture->GetCameraType(), c.type);
        EXPECT_EQ(capture->HasOrientation(), c.oriented);
        EXPECT_EQ(capture->GetPerspectiveViewAngle(), c.angle);
        EXPECT_EQ(capture->GetOrthographicZoomFactor(), c.zoom);
    }
}

TEST(VizCaptureLoaderTest, NamesEachBodyByItsInstancesAndPartId) {
    ImportedVisu visu;
    // Instance 1 is "Bracket.1", instance 2 "Bolt.1", instance 3 has no name.
    visu.test.model.AddInstance(20, 30, u"Bolt.1");
    visu.test.model.AddInstance(20, 31, std::nullopt);
    TarvexAuthoredVisuCapture& record = visu.test.Visu().captures.emplace_back();
    record.managesGeometry = true;
    record.bodies = {{{}, 0, u"p", true},     {{1}, 0, u"p", true},  {{1, 2}, 0, u"p", true},
                     {{3, 1}, 0, u"p", true}, {{1, 2}, 0, {}, true}, {{1}, 0, u"p", false},
                     {{}, 0, u"p", false}};
    std::unique_ptr<VizCapture> const capture = LoadFirst(visu);
    ASSERT_TRUE(capture);
    EXPECT_EQ(capture->GetMembers(),
              (Members{u"p", u"Bracket.1p", u"Bracket.1<KolbaSlash>Bolt.1<KolbaSlash>p",
                       u"<KolbaSlash>Bracket.1<KolbaSlash>p",
                       u"Bracket.1<KolbaSlash>Bolt.1<KolbaSlash>", u"Bracket.1", u""}));
}

} // namespace
