// Speed of loading the tessellated data of one reference of one million triangles, next to a
// plain memcpy of the same bytes in the same run.
//
// The reference: one part whose visualisation data holds one mesh node of 1 000 faces. Each
// face is a grid of 50 by 10 quads: 561 vertices with a normal each and one polygon of 1 000
// triangles. In all 1 000 000 triangles and 561 000 vertices.
//
// The bytes counted are the mesh data the loaders copy out of the import library: the
// coordinates and normals (3 floats each per vertex) and the triangle indices (3 ints per
// triangle), 25.46 MB. `bytes_per_second` of each benchmark is that amount over its time.
//
//   BM_LoadMesh        VizMeshLoader on the mesh of the imported data, as the import runs it
//                      for a mesh leaf. The loaded mesh is freed outside the timed region.
//   BM_ImportReference The whole visualisation import of the reference: VizBuilder's
//                      ImportAndBuildPS on a structure of that one part, with the import
//                      library's import, the node walk, the loaders and the id map. The
//                      structure is made and deleted outside the timed region.
//   BM_LibraryImport   The import library's share of that: TarvexVisualizationImporter's
//                      Import of the part document alone. The in-memory stand-in checks
//                      every index and copies the authored data, as a real import reads it.
//   BM_Memcpy          std::memcpy of the same number of bytes between two buffers that were
//                      allocated and touched beforehand.

#include <VizBridge/contracts/kolba/AVizElementLoader.h>
#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexModel.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexVisuData.h>
#include <VizBridge/contracts/tarvex/TarvexVisuImportResult.h>
#include <VizBridge/contracts/tarvex/TarvexVisuMesh.h>
#include <VizBridge/contracts/tarvex/TarvexVisuNodeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisualizationImporter.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/loaders/VizMeshLoader.h>
#include <VizBridge/model/VizProductStructure.h>

#include <benchmark/benchmark.h>

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <memory>
#include <stdexcept>
#include <vector>

namespace {

using VizBridgeTarvex::VizBuilder;
using VizBridgeTarvex::VizProductStructure;

constexpr unsigned int kPartId = 1;
constexpr int kFaces = 1000;
constexpr int kColumns = 50;
constexpr int kRows = 10;
constexpr int kVerticesPerFace = (kColumns + 1) * (kRows + 1);
constexpr int kTrianglesPerFace = 2 * kColumns * kRows;

/// Face `f`: a grid of quads in the plane z = f, its normals along z.
TarvexAuthoredVisuFace GridFace(int f) {
    TarvexAuthoredVisuFace face;
    face.vertices.reserve(3 * kVerticesPerFace);
    for (int row = 0; row <= kRows; ++row)
        for (int column = 0; column <= kColumns; ++column)
            face.vertices.insert(
                face.vertices.end(),
                {static_cast<float>(column), static_cast<float>(row), static_cast<float>(f)});
    face.normals.reserve(3 * kVerticesPerFace);
    for (int v = 0; v < kVerticesPerFace; ++v)
        face.normals.insert(face.normals.end(), {0.0f, 0.0f, 1.0f});
    // Indices are offsets into the float arrays: vertex k starts at 3k.
    std::vector<int> indices;
    indices.reserve(3 * kTrianglesPerFace);
    for (int row = 0; row < kRows; ++row)
        for (int column = 0; column < kColumns; ++column) {
            int const corner = row * (kColumns + 1) + column;
            int const above = corner + kColumns + 1;
            indices.insert(indices.end(), {3 * corner, 3 * (corner + 1), 3 * (above + 1),
                                           3 * corner, 3 * (above + 1), 3 * above});
        }
    TarvexAuthoredVisuPolygon polygon;
    polygon.indices = std::move(indices);
    face.polygons.push_back(std::move(polygon));
    return face;
}

/// The model of the one part and one instance, authored once for the whole run.
TarvexModel const& BigPartModel() {
    static TarvexModel const model = [] {
        TarvexModel m;
        TarvexAuthoredReference& part = m.AddPart(kPartId, u"Big", u"Big.prt");
        part.visu.unit = TarvexLengthUnit_Millimeter;
        TarvexAuthoredVisuNode& mesh = part.visu.nodes.emplace_back();
        mesh.type = TarvexVisuNode::VisuMesh;
        for (int f = 0; f < kFaces; ++f)
            mesh.mesh.faces.push_back(GridFace(f));
        m.AddRootInstance(kPartId, u"Big.1");
        return m;
    }();
    return model;
}

/// The bytes of coordinates, normals and indices that loading the mesh copies.
std::int64_t MeshDataBytes() {
    std::int64_t const floats = std::int64_t{kFaces} * kVerticesPerFace * 3 * 2;
    std::int64_t const indices = std::int64_t{kFaces} * kTrianglesPerFace * 3;
    return floats * static_cast<std::int64_t>(sizeof(float)) +
           indices * static_cast<std::int64_t>(sizeof(int));
}

void BM_LoadMesh(benchmark::State& state) {
    TarvexInputProductStructure const input = BigPartModel().GetInputProductStructure();
    TarvexPartDocument const document =
        input.GetReferenceFromId(static_cast<int>(kPartId)).GetDocument();
    TarvexVisuData const data =
        TarvexVisualizationImporter().Import(document).GetVisualizationData();
    TarvexVisuNodeIter nodes = data.GetNodeIterator();
    if (!nodes.Next())
        throw std::logic_error("the part has no mesh node");
    TarvexVisuMesh const source = nodes.Current().GetMesh();
    std::vector<TarvexVisuAttributes> attributes{nodes.Current().GetAttributes()};

    for (auto _ : state) {
        VizBridgeTarvex::VizMeshLoader loader(source, &attributes, false);
        std::unique_ptr<KolbaVizCore::VizElement> mesh(loader.Load());
        benchmark::DoNotOptimize(mesh.get());
        state.PauseTiming();
        mesh.reset();
        state.ResumeTiming();
    }
    state.SetBytesProcessed(state.iterations() * MeshDataBytes());
    state.counters["triangles"] = static_cast<double>(kFaces) * kTrianglesPerFace;
}

void BM_ImportReference(benchmark::State& state) {
    TarvexMultiProcess::SetNumberOfProcessorsToUse(1);
    TarvexModel const& model = BigPartModel();
    TarvexInputProductStructure const input = model.GetInputProductStructure();
    TarvexPSImportResult const result = model.GetImportResult();
    TarvexDocument document = model.GetDocument();

    for (auto _ : state) {
        state.PauseTiming();
        VizProductStructure* made = nullptr;
        VizBuilder::MakeVizProductStructure(result, input, document, made);
        std::unique_ptr<VizProductStructure> structure(made);
        VizBuilder builder(*structure, input, nullptr);
        builder.SetImportVisu(true);
        state.ResumeTiming();

        builder.ImportAndBuildPS();

        state.PauseTiming();
        if (!structure->GetErrorMessages().empty() ||
            structure->GetVizContainer(static_cast<int>(kPartId)) == nullptr)
            state.SkipWithError("the reference did not import");
        structure.reset();
        state.ResumeTiming();
    }
    state.SetBytesProcessed(state.iterations() * MeshDataBytes());
}

void BM_LibraryImport(benchmark::State& state) {
    TarvexInputProductStructure const input = BigPartModel().GetInputProductStructure();
    TarvexPartDocument const document =
        input.GetReferenceFromId(static_cast<int>(kPartId)).GetDocument();
    for (auto _ : state) {
        TarvexVisuImportResult result = TarvexVisualizationImporter().Import(document);
        benchmark::DoNotOptimize(result);
    }
    state.SetBytesProcessed(state.iterations() * MeshDataBytes());
}

void BM_Memcpy(benchmark::State& state) {
    std::size_t const bytes = static_cast<std::size_t>(MeshDataBytes());
    std::vector<unsigned char> const source(bytes, 1);
    std::vector<unsigned char> target(bytes, 0);
    for (auto _ : state) {
        std::memcpy(target.data(), source.data(), bytes);
        benchmark::DoNotOptimize(target.data());
        benchmark::ClobberMemory();
    }
    state.SetBytesProcessed(state.iterations() * MeshDataBytes());
}

} // namespace

BENCHMARK(BM_LoadMesh)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_ImportReference)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_LibraryImport)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Memcpy)->Unit(benchmark::kMillisecond);

BENCHMARK_MAIN();
