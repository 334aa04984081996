// Speed and size of semantic records: 100 000 PMI objects of mixed classes read into one
// record each by the loader of their class, as an import of a large drawing would.
//
// The objects cycle through six annotation classes: a toleranced dimension with a leader, a
// composite position tolerance on a three-datum frame, a note, a datum, a datum target and a
// roughness symbol with three fields. Each is placed and has one leader of two points.
//
//   BM_LoadSemanticRecords  records per second (items_per_second) for the whole batch; the
//                           records are freed outside the timed region.
//   bytes_per_record        heap bytes that the loaded records hold, divided by their count,
//                           measured once: the record, its map nodes and their texts.

#include "support/LiveBytes.h"

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/semantic/VizDatumSemanticPMILoader.h>
#include <VizBridge/semantic/VizDatumTargetSemanticPMILoader.h>
#include <VizBridge/semantic/VizDimensionSemanticPMILoader.h>
#include <VizBridge/semantic/VizGDTSemanticPMILoader.h>
#include <VizBridge/semantic/VizNoteSemanticPMILoader.h>
#include <VizBridge/semantic/VizRoughnessSemanticPMILoader.h>

#include <benchmark/benchmark.h>

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace {

using namespace VizBridgeTarvex;

constexpr int kObjects = 100000;
constexpr int kClasses = 6;

template <class Record> Record placed(int index) {
    Record record;
    record.name = VizPort::Widen("Object " + std::to_string(index));
    record.id = VizPort::Widen("PMI:" + std::to_string(index));
    float const x = static_cast<float>(index % 100);
    record.positioning = TarvexAuthoredPMIPositioning{{x, 20}, TarvexPMI_Horizontal, 0, 0};
    record.leaders = {TarvexAuthoredPMILeader{{{x, 20}, {x + 5, 0}}}};
    return record;
}

/// The objects, made once, and a loader run per object.
class Batch {
public:
    Batch() {
        auto datum = std::make_shared<TarvexAuthoredPMIDatum>(placed<TarvexAuthoredPMIDatum>(0));
        datum->label = u"A";
        TarvexAuthoredPMIRefFrame frame;
        frame.label = u"A|B|C";
        frame.references.assign(3, {{{datum, TarvexPMI_NoModifier}}});
        for (int index = 0; index < kObjects; ++index) {
            switch (index % kClasses) {
            case 0: {
                auto record = placed<TarvexAuthoredPMIDimension>(index);
                record.subType = TarvexPMI_Diameter;
                record.value = 6.4;
                record.unit = TarvexPMI_DimUnitMM;
                record.numericalTolerances = {{0.1, 0}};
                m_dimensions.push_back(m_model.MakePMIObject<TarvexPMIDimension>(record));
                break;
            }
            case 1: {
                auto record = placed<TarvexAuthoredPMIGDT>(index);
                record.toleranceType = TarvexPMI_Location_TruePosition;
                record.value = 0.2;
                record.refFrame = frame;
                record.composite = TarvexAuthoredPMICompositeTolerance{
                    TarvexPMI_ValueType_Diameter, 0.05, 0, 0, TarvexPMI_NoModifier, frame};
                m_tolerances.push_back(m_model.MakePMIObject<TarvexPMIGDT>(record));
                break;
            }
            case 2: {
                auto record = placed<TarvexAuthoredPMINote>(index);
                record.texts = {TarvexAuthoredPMINoteText{}};
                record.texts[0].text = u"BREAK ALL SHARP EDGES";
                m_notes.push_back(m_model.MakePMIObject<TarvexPMINote>(record));
                break;
            }
            case 3: {
                auto record = placed<TarvexAuthoredPMIDatum>(index);
                record.label = u"B";
                m_datums.push_back(m_model.MakePMIObject<TarvexPMIDatum>(record));
                break;
            }
            case 4: {
                auto record = placed<TarvexAuthoredPMIDatumTarget>(index);
                record.label = u"A1";
                record.targetType = TarvexPMI_DTT_Point;
                m_targets.push_back(m_model.MakePMIObject<TarvexPMIDatumTarget>(record));
                break;
            }
            default: {
                auto record = placed<TarvexAuthoredPMIRoughness>(index);
                record.fields = {u"Ra 1.6", u"", u"milled"};
                m_roughnesses.push_back(m_model.MakePMIObject<TarvexPMIRoughness>(record));
                break;
            }
            }
        }
    }

    /// One record per object, in class order.
    std::vector<SemanticPMI> Load() {
        std::vector<SemanticPMI> records(kObjects);
        std::size_t next = 0;
        loadAll<VizDimensionSemanticPMILoader>(m_dimensions, records, next);
        loadAll<VizGDTSemanticPMILoader>(m_tolerances, records, next);
        loadAll<VizNoteSemanticPMILoader>(m_notes, records, next);
        loadAll<VizDatumSemanticPMILoader>(m_datums, records, next);
        for (auto& target : m_targets) {
            VizDatumTargetSemanticPMILoader(target, records[next++], WString()).Load();
        }
        loadAll<VizRoughnessSemanticPMILoader>(m_roughnesses, records, next);
        return records;
    }

private:
    template <class Loader, class Object>
    static void loadAll(std::vector<Object>& objects, std::vector<SemanticPMI>& records,
                        std::size_t& next) {
        for (auto& object : objects) {
            Loader(object, records[next++]).Load();
        }
    }

    TarvexModel m_model;
    std::vector<TarvexPMIDimension> m_dimensions;
    std::vector<TarvexPMIGDT> m_tolerances;
    std::vector<TarvexPMINote> m_notes;
    std::vector<TarvexPMIDatum> m_datums;
    std::vector<TarvexPMIDatumTarget> m_targets;
    std::vector<TarvexPMIRoughness> m_roughnesses;
};

void BM_LoadSemanticRecords(benchmark::State& state) {
    Batch batch;
    std::int64_t const before = VizBridgeBench::LiveBytes();
    std::vector<SemanticPMI> kept = batch.Load();
    double const bytesPerRecord =
        static_cast<double>(VizBridgeBench::LiveBytes() - before) / kObjects;
    kept.clear();
    kept.shrink_to_fit();
    for (auto _ : state) {
        std::vector<SemanticPMI> records = batch.Load();
        benchmark::DoNotOptimize(records.data());
        state.PauseTiming();
        records = {};
        state.ResumeTiming();
    }
    state.SetItemsProcessed(state.iterations() * kObjects);
    state.counters["bytes_per_record"] = bytesPerRecord;
}
BENCHMARK(BM_LoadSemanticRecords)->Unit(benchmark::kMillisecond);

} // namespace

BENCHMARK_MAIN();
