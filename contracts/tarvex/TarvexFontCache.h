#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexGlyphSource.h>

#include <functional>
#include <map>
#include <memory>
#include <mutex>
#include <optional>
#include <string>

/// The fonts that the text builder of one model lays out text with, each file opened on first
/// use and kept for the life of the model. Owns the glyph sources. Thread-safe: a source is
/// used by one thread at a time. Internal to the library.
///
/// A font name picks a DejaVu file (Debian package fonts-dejavu-core) by the words it holds,
/// without regard to case:
///
///   name holds                       file
///   "mono" or "courier"              DejaVuSansMono.ttf
///   "serif", "times" or "roman",
///     but not "sans"                 DejaVuSerif.ttf
///   anything else, or no name        DejaVuSans.ttf
///
/// and a name that also holds "bold" takes the bold file of that family (DejaVuSans-Bold.ttf
/// and so on).
class TarvexFontCache {
public:
    static constexpr char const* kDefaultDirectory = "/usr/share/fonts/truetype/dejavu";

    /// The directory the files are looked up in; std::nullopt: the default directory.
    void SetDirectory(std::optional<std::string> directory);
    /// The file that `fontName` picks, in the current directory.
    std::string PathFor(VizPort::WString const& fontName) const;
    /// The name of the file that `fontName` picks, by the table above.
    static std::string FileNameFor(VizPort::WString const& fontName);

    /// Runs `use` on the glyph source of the file `path`, opening it first if needed, while no
    /// other thread uses a font of this cache. Passes on what opening the file throws; a file
    /// that could not be opened is tried again on its next use.
    void Use(std::string const& path, std::function<void(TarvexGlyphSource&)> const& use);

private:
    mutable std::mutex m_mutex;
    std::optional<std::string> m_directory;
    std::map<std::string, std::unique_ptr<TarvexGlyphSource>> m_sources;
};
