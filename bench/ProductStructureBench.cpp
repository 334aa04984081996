// Speed and memory of VizBuilder::MakeVizProductStructure (assembly form) on a large tree.
//
// The assembly:
//     product
//     +- 100 root instances, one of each of 100 sub-assembly references (ids 1001..1100)
//        +- 1000 part instances each, one of every part reference (ids 1..1000), in order
// 100 100 instances in all: 100 sub-assembly instances and 100 000 part instances, each
// part reference placed 100 times. Every instance has a name and a placement; every tenth
// part instance also has a colour. The model is authored once; each iteration makes the
// structure and deletes it.
//
// Counters:
//   items_per_second  instances (entries made) per second, make and delete together
//   bytes_per_entry   bytes that MakeVizProductStructure allocated and that were still
//                     live when it returned, divided by the number of entries

#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/model/VizProductStructure.h>

#include "support/LiveBytes.h"

#include <benchmark/benchmark.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

using VizBridgeBench::LiveBytes;

namespace {

using VizBridgeTarvex::VizBuilder;
using VizBridgeTarvex::VizProductStructure;
using VizBridgeTarvex::VizPSEntry;

constexpr unsigned int kSubAssemblies = 100;
constexpr unsigned int kParts = 1000;
constexpr unsigned int kFirstSubAssemblyId = 1001;
constexpr std::int64_t kEntries = std::int64_t{kSubAssemblies} * (kParts + 1);

VizPort::WString Name(char const* stem, unsigned int number, char const* suffix = "") {
    return VizPort::Widen(stem + std::to_string(number) + suffix);
}

TarvexPlacement Translation(double x, double y) {
    TarvexPlacement placement;
    placement.translation[0] = x;
    placement.translation[1] = y;
    return placement;
}

TarvexModel MakeLargeAssembly() {
    TarvexModel model;
    model.SetProductName(u"BenchProduct");
    model.SetUnits(TarvexLengthUnit_Millimeter);
    for (unsigned int part = 1; part <= kParts; ++part)
        model.AddPart(part, Name("Part", part), Name("Part", part, ".prt"));
    for (unsigned int sub = 0; sub < kSubAssemblies; ++sub) {
        unsigned int const subId = kFirstSubAssemblyId + sub;
        model.AddAssembly(subId, Name("Sub", sub), Name("Sub", sub, ".asm"));
        model.AddRootInstance(subId, Name("Sub", sub, ".1")).placement =
            Translation(sub * 100.0, 0);
        for (unsigned int part = 1; part <= kParts; ++part) {
            TarvexAuthoredInstance& instance =
                model.AddInstance(subId, part, Name("Part", part, ".1"));
            instance.placement = Translation(0, part * 10.0);
            if (part % 10 == 0)
                instance.rgb = std::array<unsigned short, 3>{200, 100, 50};
        }
    }
    return model;
}

TarvexModel const& LargeAssembly() {
    static TarvexModel const model = MakeLargeAssembly();
    return model;
}

std::int64_t CountEntries(std::vector<VizPSEntry*> const& entries) {
    std::int64_t count = 0;
    for (VizPSEntry const* entry : entries)
        count += 1 + CountEntries(entry->GetChildren());
    return count;
}

void BM_MakeVizProductStructure(benchmark::State& state) {
    TarvexModel const& model = LargeAssembly();
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    TarvexDocument document = model.GetDocument();

    std::int64_t retainedBytes = 0;
    std::int64_t entries = 0;
    for (auto _ : state) {
        std::int64_t const before = LiveBytes();
        VizProductStructure* raw = nullptr;
        VizBuilder::MakeVizProductStructure(result, input, document, raw);
        // Ownership passes to the host with the pointer.
        std::unique_ptr<VizProductStructure> structure(raw);
        retainedBytes = LiveBytes() - before;

        if (entries == 0) {
            state.PauseTiming();
            entries = CountEntries(structure->GetChildren());
            state.ResumeTiming();
        }
    }
    if (entries != kEntries) {
        state.SkipWithError("the structure does not hold one entry per instance");
        return;
    }
    state.SetItemsProcessed(state.iterations() * entries);
    state.counters["entries"] = static_cast<double>(entries);
    state.counters["bytes_per_entry"] =
        static_cast<double>(retainedBytes) / static_cast<double>(entries);
}

BENCHMARK(BM_MakeVizProductStructure)->Unit(benchmark::kMillisecond);

} // namespace

BENCHMARK_MAIN();
