#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizText.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a text: makeOne makes an empty VizText. loadOne is left to the
/// derived loader.
class AVizTextLoader : public AVizElementLoader {
public:
    AVizTextLoader() = default;
    ~AVizTextLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizText>()); }
};

} // namespace KolbaVizCore
