#pragma once

#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPMICapture.h>
#include <VizBridge/semantic/AVizSemanticPMILoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// A capture: its flags (its own "Hidden" replaces the object's), camera, clipping plane, the
/// ids of its annotations and whether it manages which bodies show. The part entities of the
/// bodies it manages are kept for its caller in GetEntities(). A capture is no annotation, so
/// its record has neither placement nor "Leader".
class VizCapturePMILoader : public AVizSemanticPMILoader {
public:
    VizCapturePMILoader(TarvexPMICapture& object, SemanticPMI& record)
        : AVizSemanticPMILoader(object, record) {}

    std::vector<TarvexEntity> const& GetEntities() const { return m_entities; }

protected:
    void LoadSemantics() override;

    std::vector<TarvexEntity> m_entities;

private:
    void loadCamera(TarvexPMICapture const& capture);
    void loadBodies(TarvexPMICapture const& capture);
};

} // namespace VizBridgeTarvex
