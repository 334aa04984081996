#pragma once

#include <VizBridge/import/VizBuilder.h>

namespace VizBridgeTarvex {

/// Reaches the builder's entity walk, which the semantic PMI import uses, and the steps of
/// the visualisation import that the product-level and semantic PMI roads call directly.
class VizBuilderTestPeer {
public:
    static void importVisuData(VizBuilder& builder, TarvexInputPSReference const& reference) {
        builder.importVisuDataFromReference(reference);
    }
    static void graphicalContainer(VizBuilder& builder, int referenceId,
                                   TarvexVisualizationData const& data, VizContainer*& viz,
                                   VizPMIContainer*& pmi) {
        builder.importGraphicalContainer(referenceId, data, viz, pmi);
    }
    static VizPartContainer* partContainerOf(VizBuilder& builder,
                                             TarvexInputPSReference const& reference,
                                             TarvexEntity const& entity, WString& path) {
        return builder.getVizPartContainerFromReference(reference, entity, path);
    }
};

} // namespace VizBridgeTarvex
