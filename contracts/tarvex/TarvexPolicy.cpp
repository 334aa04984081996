#include <VizBridge/contracts/tarvex/TarvexPolicy.h>

bool TarvexPolicy::GetOption(std::string const& name, bool& value) const {
    auto const found = m_options.find(name);
    if (found == m_options.end()) {
        return false;
    }
    value = found->second;
    return true;
}
