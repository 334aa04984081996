#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizCapture.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a capture: makeOne makes an empty VizCapture. loadOne is left to the
/// derived loader.
class AVizCaptureLoader : public AVizElementLoader {
public:
    AVizCaptureLoader() = default;
    ~AVizCaptureLoader() override = default;

protected:
    /// Gives the capture itself, so that a loader needs no cast.
    VizCapture* makeOne() override { return keep(std::make_unique<VizCapture>()); }
};

} // namespace KolbaVizCore
