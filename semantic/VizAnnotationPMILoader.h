#pragma once

#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>
#include <VizBridge/semantic/AVizSemanticPMILoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// What every annotation has: its placement ("Position", "Orientation", "Angle",
/// "Z Depth"), its leaders, all in one "Leader" value, and the elements it is linked to,
/// which it keeps for its caller in GetEntities(). The first step of every annotation
/// class's loader.
class VizAnnotationPMILoader : public AVizSemanticPMILoader {
public:
    VizAnnotationPMILoader(TarvexPMIAnnotation& object, SemanticPMI& record)
        : AVizSemanticPMILoader(object, record) {}

    /// The linked elements in the annotation's order: the index of an element here is the
    /// index the annotation gives it.
    std::vector<TarvexEntity> const& GetEntities() const { return m_entities; }

protected:
    void LoadSemantics() override;

    std::vector<TarvexEntity> m_entities;

private:
    void loadPositioning();
    void loadLeaders();
};

} // namespace VizBridgeTarvex
