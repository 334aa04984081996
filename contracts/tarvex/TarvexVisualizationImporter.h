#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuImportResult.h>

class TarvexPartDocument;
class TarvexPolicy;

/// Imports the visualisation data of a part document. The import reads the data as the model
/// holds it at that moment and keeps its own copy: authoring afterwards is not seen by what it
/// gave. Every call is entered in the model's import log.
class TarvexVisualizationImporter {
public:
    /// Throws std::invalid_argument for a document that names no reference of a model, or
    /// whose data has an index that starts no whole point of the coordinates it indexes (an
    /// edge's points, a face's vertices and normals, a point set's points), and whatever the
    /// model's fault plan has planned for the import.
    TarvexVisuImportResult Import(TarvexPartDocument const& document) const;
    /// As Import. This stand-in reads no option of the policy: the data is the same.
    TarvexVisuImportResult ImportWithPolicy(TarvexPolicy const& policy,
                                            TarvexPartDocument const& document) const;
};
