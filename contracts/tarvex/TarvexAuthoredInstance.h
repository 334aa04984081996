#pragma once

#include <VizBridge/contracts/platform/WString.h>

#include <array>
#include <optional>

/// A placement: rotation by rows and translation.
struct TarvexPlacement {
    double rotation[3][3] = {{1, 0, 0}, {0, 1, 0}, {0, 0, 1}};
    double translation[3] = {0, 0, 0};
};

/// An instance as a host or test describes it. Every optional value may be absent.
struct TarvexAuthoredInstance {
    unsigned int instanceId = 0;  ///< given by TarvexModel; the fault subject of its operations
    unsigned int referenceId = 0; ///< the unique id of the reference it places
    std::optional<VizPort::WString> name;
    std::optional<TarvexPlacement> placement;
    std::optional<std::array<unsigned short, 3>> rgb;
    std::optional<unsigned short> alpha;
    std::optional<bool> hidden;
    std::optional<bool> suppressed;
};
