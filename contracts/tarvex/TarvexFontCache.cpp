#include <VizBridge/contracts/tarvex/TarvexFontCache.h>

#include <algorithm>
#include <string_view>

namespace {

/// The name in lower case; characters beyond ASCII cannot name a family and pass unchanged.
std::u16string lowered(VizPort::WString const& name) {
    std::u16string lower(name.begin(), name.end());
    std::transform(lower.begin(), lower.end(), lower.begin(), [](char16_t c) {
        return c >= u'A' && c <= u'Z' ? static_cast<char16_t>(c - u'A' + u'a') : c;
    });
    return lower;
}

bool holds(std::u16string const& text, std::u16string_view word) {
    return text.find(word) != std::u16string::npos;
}

} // namespace

void TarvexFontCache::SetDirectory(std::optional<std::string> directory) {
    std::lock_guard<std::mutex> const lock(m_mutex);
    m_directory = std::move(directory);
}

std::string TarvexFontCache::FileNameFor(VizPort::WString const& fontName) {
    std::u16string const name = lowered(fontName);
    std::string family = "DejaVuSans";
    if (holds(name, u"mono") || holds(name, u"courier")) {
        family = "DejaVuSansMono";
    } else if (!holds(name, u"sans") &&
               (holds(name, u"serif") || holds(name, u"times") || holds(name, u"roman"))) {
        family = "DejaVuSerif";
    }
    return family + (holds(name, u"bold") ? "-Bold.ttf" : ".ttf");
}

std::string TarvexFontCache::PathFor(VizPort::WString const& fontName) const {
    std::lock_guard<std::mutex> const lock(m_mutex);
    return m_directory.value_or(kDefaultDirectory) + "/" + FileNameFor(fontName);
}

void TarvexFontCache::Use(std::string const& path,
                          std::function<void(TarvexGlyphSource&)> const& use) {
    std::lock_guard<std::mutex> const lock(m_mutex);
    std::unique_ptr<TarvexGlyphSource>& source = m_sources[path];
    if (!source) {
        try {
            source = std::make_unique<TarvexGlyphSource>(path);
        } catch (...) {
            m_sources.erase(path);
            throw;
        }
    }
    use(*source);
}
