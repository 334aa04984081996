#pragma once

#include <optional>
#include <string>
#include <vector>

namespace VizBridgeImporter {

/// What the command line asks for.
struct ImportOptions {
    enum class Road { Visualisation, Brep };

    std::string file;
    Road road = Road::Visualisation;
    bool pmi = false;     ///< also the graphical PMI, its glyphs drawn as geometry
    bool spooler = false; ///< convert BREP parts on every processor
    bool scene = false;   ///< print the scene tree after the render
    bool quiet = false;   ///< no progress bar

    /// The options of `arguments` (without the program name), or nothing and a one-line
    /// reason in `error`. `--help` gives nothing and an empty `error`.
    static std::optional<ImportOptions> Parse(std::vector<std::string> const& arguments,
                                              std::string& error);
    static char const* Usage();
};

} // namespace VizBridgeImporter
