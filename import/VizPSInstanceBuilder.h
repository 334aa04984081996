#pragma once

#include <VizBridge/model/VizTypes.h>

class TarvexInputPSInstance;
class TarvexInputPSReference;

namespace VizBridgeTarvex {

class VizPSEntry;

/// The only way to make a VizPSEntry. Both operations hand a new entry to the caller
/// through `out`, which then owns it (VizBuilder passes it on to the product structure).
class VizPSInstanceBuilder {
public:
    VizPSInstanceBuilder() = delete;

    /// An entry for one input instance of `reference`: names, placement, flags and colour.
    /// An exception of the import library leaves `out` as it was and frees what was made.
    static void MakeVizPSInstance(TarvexInputPSInstance const& instance,
                                  TarvexInputPSReference const& reference, VizPSEntry*& out);
    /// A part entry with `name` as both reference and instance name, identity placement,
    /// no colour, no flags.
    static void MakeVizPSInstance(int const& id, WString const& name, VizPSEntry*& out);
};

} // namespace VizBridgeTarvex
