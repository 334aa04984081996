#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizWire.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a wire: makeOne makes an empty VizWire. loadOne is left to the
/// derived loader.
class AVizWireLoader : public AVizElementLoader {
public:
    AVizWireLoader() = default;
    ~AVizWireLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizWire>()); }
};

} // namespace KolbaVizCore
