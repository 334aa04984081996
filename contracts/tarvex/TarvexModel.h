#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredDocument.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredInstance.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredReference.h>
#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexFaultPlan.h>
#include <VizBridge/contracts/tarvex/TarvexImportCall.h>
#include <VizBridge/contracts/tarvex/TarvexLengthUnitType.h>
#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <memory>
#include <optional>
#include <string>
#include <thread>
#include <vector>

class TarvexDocument;
class TarvexInputProductStructure;
class TarvexPSImportResult;
class TarvexModelData;

/// The in-memory document model behind the library's value objects, and the authoring API
/// through which a host or test fills it. The value objects handed out share the model's
/// data and keep it alive; authoring after they were handed out is seen by them, except by
/// visualisation data, which an import copies as it stands.
/// Not thread-safe while authoring; reading through value objects is.
/// A moved-from model hands out empty value objects, and its next authoring call starts a
/// new, empty model.
class TarvexModel {
public:
    TarvexModel();
    ~TarvexModel();
    TarvexModel(TarvexModel&&) noexcept;
    TarvexModel& operator=(TarvexModel&&) noexcept;
    TarvexModel(TarvexModel const&) = delete;
    TarvexModel& operator=(TarvexModel const&) = delete;

    // Product.
    void SetProductName(std::optional<VizPort::WString> name);
    void SetUnits(TarvexLengthUnitType unit);
    /// Overrides GetUniqueReferencesCount, which otherwise counts the distinct references
    /// reachable from the root instances. A reference that is placed but was never added is
    /// not counted: it reads back as an empty sub-assembly.
    void SetUniqueReferencesCount(std::optional<int> count);

    /// Adds a reference and returns its record, which stays valid as long as the model.
    /// A unique id that is already used replaces nothing: the existing record is returned.
    TarvexAuthoredReference& AddPart(unsigned int uniqueId, std::optional<VizPort::WString> name,
                                     std::optional<VizPort::WString> storageName = std::nullopt);
    TarvexAuthoredReference&
    AddAssembly(unsigned int uniqueId, std::optional<VizPort::WString> name,
                std::optional<VizPort::WString> storageName = std::nullopt);
    /// The record of a reference added before, or null.
    TarvexAuthoredReference* FindReference(unsigned int uniqueId);

    /// Places `referenceId` at the top of the product / below `parentId`. The reference
    /// need not exist yet; an instance of an unknown reference gives an empty reference.
    /// Instances get the authoring ids 1, 2, 3, ... in the order they are added, and the
    /// record stays valid as long as the model. AddInstance throws std::invalid_argument,
    /// and adds nothing, when `parentId` names no reference added before.
    TarvexAuthoredInstance& AddRootInstance(unsigned int referenceId,
                                            std::optional<VizPort::WString> name);
    TarvexAuthoredInstance& AddInstance(unsigned int parentId, unsigned int referenceId,
                                        std::optional<VizPort::WString> name);

    TarvexAuthoredDocument& Document();
    void AddMissingFile(std::optional<VizPort::WString> name);

    TarvexFaultPlan& Faults();

    // Multi-process conversion.
    /// The spooler delivers the part references in this order (each still only once its
    /// conversion is done); parts not listed follow in the order their conversions finish.
    void SetSpoolerDeliveryOrder(std::vector<unsigned int> order);
    /// The spooler delivers `deliveredId` in place of reference `referenceId`, and
    /// GetReferenceFromId(deliveredId) gives reference `referenceId`: a delivery whose id
    /// does not match its reference.
    void SetSpoolerIdAlias(unsigned int referenceId, unsigned int deliveredId);

    // Diagnostics of the part conversions, for tests.
    /// How many times the part `referenceId` was converted, by the spooler's workers or by
    /// TarvexPartDocument::GetConvertedPart: at most 1 unless a conversion ran out of memory.
    int GetConversionCount(unsigned int referenceId) const;
    /// The thread that converted the part `referenceId`; std::nullopt if none did yet.
    std::optional<std::thread::id> GetConversionThread(unsigned int referenceId) const;

    // Entities.
    /// An entity `entityId` of a part, reached through `instancePath` (instance authoring
    /// ids from the top; empty: in the part itself).
    TarvexEntity MakeEntity(std::vector<unsigned int> instancePath, unsigned int entityId) const;
    TarvexEntity MakeEntity(TarvexAuthoredEntity entity) const;
    /// A PMI object of this model made from its record: `Object` is the value class, such as
    /// TarvexPMIDimension for a TarvexAuthoredPMIDimension. Its operations ask the model's
    /// fault plan, with the subject 0.
    template <class Object, class Record> Object MakePMIObject(Record record) const {
        return Object(TarvexVisuContext(m_data, 0),
                      std::make_shared<Record const>(std::move(record)));
    }

    // Visualisation data, authored in each reference's `visu` record.
    /// The directory in which the text builder looks for its font files; std::nullopt: the
    /// system's DejaVu directory (see TarvexFontCache).
    void SetFontDirectory(std::optional<std::string> directory);
    /// The importer calls made on this model so far, in order, also those that threw.
    std::vector<TarvexImportCall> GetImportCalls() const;

    // Value objects onto this model.
    TarvexPSImportResult GetImportResult() const;
    TarvexInputProductStructure GetInputProductStructure() const;
    TarvexDocument GetDocument() const;

private:
    /// The data to author into, made anew after a move.
    TarvexModelData& data();

    std::shared_ptr<TarvexModelData> m_data; ///< shared with the value objects handed out
};
