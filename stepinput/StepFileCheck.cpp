#include <VizBridge/stepinput/StepFileCheck.h>

#include <VizBridge/stepinput/StepReadError.h>
#include <VizBridge/stepinput/StepRecordScan.h>

#include <algorithm>
#include <cctype>
#include <cerrno>
#include <cstring>
#include <fstream>
#include <string_view>
#include <vector>

namespace VizBridgeStep {

namespace {

constexpr std::size_t kHeaderBytes = 64 * 1024;
constexpr std::size_t kTrailerBytes = 4 * 1024;
constexpr std::size_t kBlockBytes = 1024 * 1024;

[[noreturn]] void fail(std::string const& path, std::string const& why) {
    throw StepReadError(path + ": " + why);
}

/// The text with every white space removed, upper case: the exchange structure allows white
/// space between tokens.
std::string squeezed(std::string_view text) {
    std::string out;
    for (char const c : text)
        if (!std::isspace(static_cast<unsigned char>(c)))
            out += static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
    return out;
}

} // namespace

std::string StepFileCheck::Check(std::string const& path) {
    std::ifstream file(path, std::ios::binary | std::ios::ate);
    if (!file)
        fail(path, std::string("cannot open the file: ") + std::strerror(errno));
    std::streamoff const size = file.tellg();
    if (size <= 0)
        fail(path, "the file is empty");

    std::string head(static_cast<std::size_t>(std::min<std::streamoff>(size, kHeaderBytes)), '\0');
    file.seekg(0);
    file.read(head.data(), static_cast<std::streamsize>(head.size()));
    if (head.find('\0') != std::string::npos)
        fail(path, "not a STEP file (binary content)");
    std::string const start = squeezed(std::string_view(head).substr(0, 64));
    if (start.rfind("ISO-10303-21;", 0) != 0)
        fail(path, "not a STEP file (it does not begin with ISO-10303-21;)");

    std::string tail(static_cast<std::size_t>(std::min<std::streamoff>(size, kTrailerBytes)), '\0');
    file.seekg(size - static_cast<std::streamoff>(tail.size()));
    file.read(tail.data(), static_cast<std::streamsize>(tail.size()));
    if (squeezed(tail).find("END-ISO-10303-21;") == std::string::npos)
        fail(path, "the file is truncated (no END-ISO-10303-21;)");

    std::string const header = squeezed(head);
    std::size_t const schemaAt = header.find("FILE_SCHEMA((");
    if (schemaAt == std::string::npos)
        fail(path, "the header names no FILE_SCHEMA");
    std::size_t const nameStart = header.find('\'', schemaAt);
    std::size_t const nameEnd =
        nameStart == std::string::npos ? nameStart : header.find('\'', nameStart + 1);
    if (nameEnd == std::string::npos)
        fail(path, "the header names no FILE_SCHEMA");
    std::string schema = header.substr(nameStart + 1, nameEnd - nameStart - 1);
    schema = schema.substr(0, schema.find('{')); // the object identifier says nothing more
    char const* const known[] = {"AP242", "AUTOMOTIVE_DESIGN", "CONFIG_CONTROL_DESIGN", "AP203",
                                 "AP214"};
    if (std::none_of(std::begin(known), std::end(known),
                     [&](char const* name) { return schema.find(name) != std::string::npos; }))
        fail(path, "the schema " + schema + " is not one of AP203, AP214 or AP242");

    // Open CASCADE's reader can crash on a name given twice and leak on a record without one.
    StepRecordScan records;
    std::vector<char> block(kBlockBytes);
    file.clear();
    file.seekg(0);
    while (
        records.Fault().empty() &&
        (file.read(block.data(), static_cast<std::streamsize>(block.size())) || file.gcount() > 0))
        for (std::streamsize i = 0; i < file.gcount(); ++i)
            records.Feed(block[static_cast<std::size_t>(i)]);
    records.Finish();
    if (!records.Fault().empty())
        fail(path, records.Fault());
    return schema;
}

} // namespace VizBridgeStep
