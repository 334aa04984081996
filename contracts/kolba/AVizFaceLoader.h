#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizFace.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a face: makeOne makes an empty VizFace. loadOne is left to the
/// derived loader.
class AVizFaceLoader : public AVizElementLoader {
public:
    AVizFaceLoader() = default;
    ~AVizFaceLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizFace>()); }
};

} // namespace KolbaVizCore
