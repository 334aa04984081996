#include <VizBridge/contracts/kolba/VizView.h>

namespace KolbaVizCore {

VizPort::WString VizView::GetViewAsString() const {
    VizPort::WString const name = GetName();
    if (name.empty())
        return name;
    return u"View : " + name;
}

} // namespace KolbaVizCore
