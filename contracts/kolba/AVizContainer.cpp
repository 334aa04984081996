#include <VizBridge/contracts/kolba/AVizContainer.h>

namespace KolbaVizCore {

bool AVizContainer::PickVisual(AView3DAdapter*, Ray const&, VizElement*&) {
    return false;
}

} // namespace KolbaVizCore
