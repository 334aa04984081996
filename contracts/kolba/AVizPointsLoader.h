#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizPoints.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a group of points: makeOne makes an empty VizPoints. loadOne is left to
/// the derived loader.
class AVizPointsLoader : public AVizElementLoader {
public:
    AVizPointsLoader() = default;
    ~AVizPointsLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizPoints>()); }
};

} // namespace KolbaVizCore
