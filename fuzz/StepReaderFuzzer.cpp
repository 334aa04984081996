// libFuzzer harness for the STEP reader: any bytes, written to a file, must read or be refused
// with a StepReadError; nothing else may come out, and nothing may crash or leak.
#include <VizBridge/stepinput/StepDocument.h>
#include <VizBridge/stepinput/StepReadError.h>

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <string>
#include <unistd.h>

namespace {

/// The reader takes a path: one scratch file per fuzzing process, gone when it ends.
class ScratchFile {
public:
    ScratchFile()
        : m_path((std::filesystem::temp_directory_path() /
                  ("vizbridge-fuzz-" + std::to_string(getpid()) + ".stp"))
                     .string()) {}
    ~ScratchFile() {
        std::error_code ignored;
        std::filesystem::remove(m_path, ignored);
    }
    ScratchFile(ScratchFile const&) = delete;
    ScratchFile& operator=(ScratchFile const&) = delete;

    std::string const& Path() const { return m_path; }

private:
    std::string m_path;
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    static ScratchFile const scratch;
    std::string const& path = scratch.Path();
    {
        std::ofstream file(path, std::ios::binary | std::ios::trunc);
        file.write(reinterpret_cast<char const*>(data), static_cast<std::streamsize>(size));
    }
    try {
        VizBridgeStep::StepDocument::Read(path);
    } catch (VizBridgeStep::StepReadError const&) {
        // A refused file is an answer, not a finding.
    }
    return 0;
}
