#include "ImportOptions.h"

namespace VizBridgeImporter {

char const* ImportOptions::Usage() {
    return "usage: vizbridge-import [--visu | --brep] [--pmi] [--spooler] [--scene] [--quiet] "
           "FILE.stp\n"
           "\n"
           "Reads a STEP AP203/AP214/AP242 file, builds VizBridge's product structure from it,\n"
           "imports every part, draws the structure into a scene, and prints the instance tree,\n"
           "the document strings, the failures, counts and timings.\n"
           "\n"
           "  --visu     import each part's tessellated data (the default)\n"
           "  --brep     import each part's BREP through the Open CASCADE modeler\n"
           "  --pmi      also import the graphical PMI and the saved views\n"
           "  --spooler  convert BREP parts on every processor (with --brep)\n"
           "  --scene    print the scene tree after the render\n"
           "  --quiet    no progress bar\n"
           "  --help     this text\n"
           "\n"
           "Exit status: 0 imported, 1 the file could not be read, 2 bad usage, 3 an internal\n"
           "failure.\n";
}

std::optional<ImportOptions> ImportOptions::Parse(std::vector<std::string> const& arguments,
                                                  std::string& error) {
    ImportOptions options;
    bool roadGiven = false;
    error.clear();
    for (std::string const& argument : arguments) {
        if (argument == "--help" || argument == "-h")
            return std::nullopt;
        if (argument == "--visu" || argument == "--brep") {
            Road const road = argument == "--visu" ? Road::Visualisation : Road::Brep;
            if (roadGiven && road != options.road) {
                error = "--visu and --brep exclude each other";
                return std::nullopt;
            }
            options.road = road;
            roadGiven = true;
        } else if (argument == "--pmi") {
            options.pmi = true;
        } else if (argument == "--spooler") {
            options.spooler = true;
        } else if (argument == "--scene") {
            options.scene = true;
        } else if (argument == "--quiet") {
            options.quiet = true;
        } else if (argument.rfind("-", 0) == 0 && argument.size() > 1) {
            error = "unknown option " + argument;
            return std::nullopt;
        } else if (!options.file.empty()) {
            error = "one file at a time: " + options.file + " and " + argument;
            return std::nullopt;
        } else {
            options.file = argument;
        }
    }
    if (options.file.empty()) {
        error = "no file given";
        return std::nullopt;
    }
    if (options.spooler && options.road != Road::Brep) {
        error = "--spooler converts BREP parts: use it with --brep";
        return std::nullopt;
    }
    return options;
}

} // namespace VizBridgeImporter
