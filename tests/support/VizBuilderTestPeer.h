#pragma once

#include "import/VizBuilder.h"

namespace VizBridgeTarvex {

/// Reaches the builder's entity walk, which the semantic PMI import uses.
class VizBuilderTestPeer {
public:
    static VizPartContainer* partContainerOf(VizBuilder& builder,
                                             TarvexInputPSReference const& reference,
                                             TarvexEntity const& entity, WString& path) {
        return builder.getVizPartContainerFromReference(reference, entity, path);
    }
};

} // namespace VizBridgeTarvex
