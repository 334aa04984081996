#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizEdge.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of an edge: makeOne makes an empty VizEdge. loadOne is left to the
/// derived loader.
class AVizEdgeLoader : public AVizElementLoader {
public:
    AVizEdgeLoader() = default;
    ~AVizEdgeLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizEdge>()); }
};

} // namespace KolbaVizCore
