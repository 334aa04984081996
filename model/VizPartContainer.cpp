#include <VizBridge/model/VizPartContainer.h>

namespace VizBridgeTarvex {

std::string VizPartContainer::GetTypeName() const {
    char const* const modelerType = GetModelerTypeName();
    return std::string(modelerType ? modelerType : "") + " BREP Container";
}

} // namespace VizBridgeTarvex
