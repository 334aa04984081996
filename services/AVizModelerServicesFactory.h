#pragma once

namespace VizBridgeTarvex {

class VizModelerServices;

/// Offered to hosts that want to make their modeler services through a factory. The system
/// itself never holds one.
class AVizModelerServicesFactory {
public:
    AVizModelerServicesFactory() = default;
    AVizModelerServicesFactory(AVizModelerServicesFactory const&) = default;
    AVizModelerServicesFactory& operator=(AVizModelerServicesFactory const&) = default;

    /// New services, owned by the caller.
    virtual VizModelerServices* CreateModelerServices() = 0;
    virtual ~AVizModelerServicesFactory() = default;
};

} // namespace VizBridgeTarvex
