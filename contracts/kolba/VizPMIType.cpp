#include <VizBridge/contracts/kolba/VizPMIType.h>

namespace KolbaVizCore {

VizPMIType::VizPMIType(ID const& id, char const* name, EntityType const& entityType)
    : m_id(id), m_name(name != nullptr ? name : ""), m_entityType(entityType) {}

} // namespace KolbaVizCore
