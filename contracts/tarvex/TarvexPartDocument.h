#pragma once

#include <VizBridge/contracts/tarvex/TarvexConvertedPart.h>
#include <VizBridge/contracts/tarvex/TarvexPMIData.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

class TarvexModelData;

/// The document of one part reference, which a modeler imports. A default object names no
/// part.
class TarvexPartDocument {
public:
    TarvexPartDocument() = default;
    TarvexPartDocument(std::shared_ptr<TarvexModelData const> data, unsigned int referenceId)
        : m_data(std::move(data)), m_referenceId(referenceId) {}

    bool IsValid() const { return m_data != nullptr; }
    unsigned int GetReferenceId() const { return m_referenceId; }
    TarvexWString GetName() const;

    /// The part in modeler-ready form. Converted on first use, on the calling thread, unless
    /// the multi-process spooler converted it already; every later call gives the same
    /// object. Null for an invalid document or a conversion that fails.
    std::shared_ptr<TarvexConvertedPart const> GetConvertedPart() const;
    /// The part's PMI.
    TarvexPMIData GetPMIData() const;

private:
    // The importer reads the document's data from its model.
    friend class TarvexVisualizationImporter;

    std::shared_ptr<TarvexModelData const> m_data;
    unsigned int m_referenceId = 0;
};
