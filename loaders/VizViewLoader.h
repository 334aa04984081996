#pragma once

#include <VizBridge/contracts/kolba/AVizViewLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuView.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads one view: its hidden state, name, visual and mechanical ids, its plane, and the ids
/// of the annotations it groups as member keys.
class VizViewLoader : public VizSourceLoader<KolbaVizCore::AVizViewLoader, TarvexVisuView> {
public:
    VizViewLoader(TarvexVisuView const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizViewLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex
