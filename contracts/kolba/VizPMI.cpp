#include <VizBridge/contracts/kolba/VizPMI.h>

namespace KolbaVizCore {

VizPort::WString VizPMI::ToString() const {
    if (m_name.empty())
        return VizPort::WString();
    return u"PMI : " + m_name;
}

} // namespace KolbaVizCore
