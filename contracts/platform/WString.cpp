#include <VizBridge/contracts/platform/WString.h>

namespace VizPort {

WString Widen(std::string const& bytes) {
    WString text;
    text.reserve(bytes.size());
    for (char const byte : bytes)
        text.push_back(static_cast<char16_t>(static_cast<unsigned char>(byte)));
    return text;
}

std::string Narrow(WString const& text) {
    std::string bytes;
    bytes.reserve(text.size());
    for (char16_t const c : text)
        bytes.push_back(c <= 0xFF ? static_cast<char>(static_cast<unsigned char>(c)) : '?');
    return bytes;
}

} // namespace VizPort
