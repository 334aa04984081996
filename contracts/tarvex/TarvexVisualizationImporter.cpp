#include <VizBridge/contracts/tarvex/TarvexVisualizationImporter.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuData.h>
#include <VizBridge/contracts/tarvex/TarvexModelData.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexPolicy.h>

#include <algorithm>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace {

/// Whether every offset of `indices` starts a whole point of `coordinates`.
bool pointsInto(std::optional<std::vector<int>> const& indices,
                std::vector<float> const& coordinates) {
    return !indices || std::all_of(indices->begin(), indices->end(), [&](int offset) {
        return offset >= 0 && std::size_t(offset) + 3 <= coordinates.size();
    });
}

bool edgesValid(std::vector<TarvexAuthoredVisuEdge> const& edges) {
    return std::all_of(edges.begin(), edges.end(), [](TarvexAuthoredVisuEdge const& edge) {
        return pointsInto(edge.lineIndices, edge.points);
    });
}

/// Readers of the data follow its indices without checking them, as they may with the real
/// library's data; authored data that breaks that promise is refused here, with a clear
/// message, rather than read out of bounds later.
void validate(TarvexAuthoredVisuData const& data, std::string const& operation) {
    auto const refuse = [&operation](std::size_t node, char const* what) {
        throw std::invalid_argument(operation + ": node " + std::to_string(node) + " has " + what +
                                    " indices outside its coordinates");
    };
    for (std::size_t n = 0; n < data.nodes.size(); ++n) {
        TarvexAuthoredVisuNode const& node = data.nodes[n];
        if (!edgesValid(node.mesh.edges) || !edgesValid(node.wire.edges) ||
            !edgesValid(node.pmi.edges)) {
            refuse(n, "edge");
        }
        for (TarvexAuthoredVisuFace const& face : node.mesh.faces) {
            for (TarvexAuthoredVisuPolygon const& polygon : face.polygons) {
                if (!pointsInto(polygon.indices, face.vertices) ||
                    !pointsInto(polygon.indices, face.normals)) {
                    refuse(n, "polygon");
                }
            }
        }
        for (TarvexAuthoredVisuPoints const& points : node.pointSet.points) {
            if (!pointsInto(points.pointIndices, points.points)) {
                refuse(n, "point");
            }
        }
    }
}

TarvexVisuImportResult import(char const* operation, TarvexPartDocument const& document,
                              std::shared_ptr<TarvexModelData const> const& model) {
    if (!model) {
        throw std::invalid_argument(std::string(operation) + ": the document names no part");
    }
    unsigned int const referenceId = document.GetReferenceId();
    model->importLog.Add(TarvexImportCall{operation, referenceId});
    model->faults.Check(operation, referenceId);
    TarvexAuthoredReference const* const reference = model->FindReference(referenceId);
    if (reference == nullptr) {
        throw std::invalid_argument(std::string(operation) + ": no reference with unique id " +
                                    std::to_string(referenceId));
    }
    validate(reference->visu, operation);
    TarvexVisuContext const context(model, referenceId);
    // The import's own copy: the value objects it hands out point into it, so later authoring
    // must not move what they point at.
    auto snapshot = std::make_shared<TarvexAuthoredVisuData const>(reference->visu);
    return TarvexVisuImportResult(context, TarvexVisuData(context, std::move(snapshot)));
}

} // namespace

TarvexVisuImportResult
TarvexVisualizationImporter::Import(TarvexPartDocument const& document) const {
    return import("TarvexVisualizationImporter::Import", document, document.m_data);
}

TarvexVisuImportResult
TarvexVisualizationImporter::ImportWithPolicy(TarvexPolicy const& /*policy*/,
                                              TarvexPartDocument const& document) const {
    return import("TarvexVisualizationImporter::ImportWithPolicy", document, document.m_data);
}
