#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizView.h>

#include <memory>

namespace KolbaVizCore {

/// Base of the loaders of a view: makeOne makes an empty VizView. loadOne is left to the
/// derived loader.
class AVizViewLoader : public AVizElementLoader {
public:
    AVizViewLoader() = default;
    ~AVizViewLoader() override = default;

protected:
    VizElement* makeOne() override { return keep(std::make_unique<VizView>()); }
};

} // namespace KolbaVizCore
