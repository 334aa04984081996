#pragma once

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/EntityType.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPMIType.h>

namespace KolbaVizCore {

/// Base of the loaders of PMI objects. A PMI object gets its group and type when it is made,
/// so a derived loader calls setGroupAndType before makeOne; until then both are the
/// undefined type with the entity type UnknownPMI and an empty name. loadOne is left to the
/// derived loader.
class AVizPMILoader : public AVizElementLoader {
public:
    AVizPMILoader() = default;
    ~AVizPMILoader() override = default;

protected:
    /// Makes an empty VizPMI of the group and type last set.
    VizElement* makeOne() override;

    void setGroupAndType(VizPMIType const& group, VizPMIType const& type) {
        m_group = group;
        m_type = type;
    }
    VizPMIType getGroupType() const { return m_group; }
    VizPMIType getType() const { return m_type; }

private:
    VizPMIType m_group{VizPMIType::UndefinedPMI, "", UnknownPMI};
    VizPMIType m_type{VizPMIType::UndefinedPMI, "", UnknownPMI};
};

} // namespace KolbaVizCore
