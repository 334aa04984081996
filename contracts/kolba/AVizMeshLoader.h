#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizMesh.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a mesh: makeOne makes an empty VizMesh. loadOne is left to the
/// derived loader.
class AVizMeshLoader : public AVizElementLoader {
public:
    AVizMeshLoader() = default;
    ~AVizMeshLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizMesh>()); }
};

} // namespace KolbaVizCore
