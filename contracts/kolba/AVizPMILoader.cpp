#include <VizBridge/contracts/kolba/AVizPMILoader.h>

#include <memory>

namespace KolbaVizCore {

VizElement* AVizPMILoader::makeOne() {
    return keep(std::make_unique<VizPMI>(m_group, m_type));
}

} // namespace KolbaVizCore
