#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizPolygon.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a polygon: makeOne makes an empty VizPolygon. loadOne is left to the
/// derived loader.
class AVizPolygonLoader : public AVizElementLoader {
public:
    AVizPolygonLoader() = default;
    ~AVizPolygonLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizPolygon>()); }
};

} // namespace KolbaVizCore
