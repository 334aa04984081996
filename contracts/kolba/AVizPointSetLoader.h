#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a point set: makeOne makes an empty VizPointSet. loadOne is left to the
/// derived loader.
class AVizPointSetLoader : public AVizElementLoader {
public:
    AVizPointSetLoader() = default;
    ~AVizPointSetLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizPointSet>()); }
};

} // namespace KolbaVizCore
