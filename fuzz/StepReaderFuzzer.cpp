// libFuzzer harness for the STEP reader: any bytes, written to a file, must read or be refused
// with a StepReadError; nothing else may come out, and nothing may crash or leak.
#include <VizBridge/stepinput/StepDocument.h>
#include <VizBridge/stepinput/StepReadError.h>

#include <cstddef>
#include <cstdint>
#include <fstream>
#include <string>
#include <unistd.h>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    // The reader takes a path: one scratch file per fuzzing process.
    static std::string const path = "/tmp/vizbridge-fuzz-" + std::to_string(getpid()) + ".stp";
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
