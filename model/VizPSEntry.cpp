#include <VizBridge/model/VizPSEntry.h>

#include <VizBridge/model/VizProductStructure.h>

namespace VizBridgeTarvex {

VizPSEntry::VizPSEntry(unsigned long const& id, WString const& referenceName,
                       WString const& instanceName, bool const& isPart)
    : m_referenceName(referenceName), m_instanceName(instanceName), m_isPart(isPart) {
    setID(id);
}

VizContainer* VizPSEntry::GetVizContainer() const {
    return m_productStructure ? m_productStructure->GetVizContainer(GetID()) : nullptr;
}

VizPMIContainer* VizPSEntry::GetVizPMIContainer() const {
    return m_productStructure ? m_productStructure->GetVizPMIContainer(GetID()) : nullptr;
}

VizPartContainer* VizPSEntry::GetVizPartContainer() const {
    if (!m_isPart || !m_productStructure)
        return nullptr;
    return m_productStructure->GetVizPartContainer(GetID());
}

WString VizPSEntry::ToString(int depth) const {
    WString text;
    for (int level = 0; level < depth; ++level)
        text += u"   ";
    text += m_isPart ? u"Part: instance: " : u"Product: instance: ";
    text += m_instanceName;
    text += u" of reference: ";
    text += m_referenceName;
    text += u'\n';
    if (m_isPart)
        return text;
    for (VizPSEntry const* child : m_children) {
        if (child) // AddChild stores what it is given; a null child prints nothing
            text += child->ToString(depth + 1);
    }
    return text;
}

} // namespace VizBridgeTarvex
