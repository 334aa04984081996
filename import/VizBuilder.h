#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuNode.h>
#include <VizBridge/model/SemanticPMIMaps.h>
#include <VizBridge/model/VizDocumentInfo.h>
#include <VizBridge/model/VizTypes.h>

#include <map>
#include <memory>
#include <vector>

class TarvexDocument;
class TarvexEntity;
class TarvexInputProductStructure;
class TarvexInputPSReference;
class TarvexPMIData;
class TarvexPolicy;
class TarvexPSImportResult;
class TarvexVisuAttributes;
class TarvexVisualizationData;

namespace VizBridgeTarvex {

class SemanticPMIBatch;
class VisuIdMapJournal;
class VizModelerServices;
class VizPartContainer;
class VizProductStructure;
class VizPSEntry;

/// Builds a VizProductStructure from the import library's data.
///
/// The static MakeVizProductStructure forms create the structure and its instance tree and
/// hand it to the host, which owns it from then on. A builder made on that structure then
/// imports the data behind the tree with ImportAndBuildPS. The builder holds the structure,
/// the input, the policy and the modeler services without owning any of them; it may be
/// destroyed as soon as ImportAndBuildPS has returned.
///
/// Failures never show in a result: each becomes a text that
/// VizProductStructure::GetErrorMessages gives. Exceptions of the import library stay inside,
/// except in the instance tree of the assembly form when KolbaVizCore::GetAllowThrow() is on.
class VizBuilder {
public:
    /// Progress of the import: `text` is null at the first and the last call.
    using ProgressCallback = void (*)(int const& current, int const& total, char16_t const* text);

    /// Assembly form: document strings, missing files and the whole instance tree.
    /// `out` receives the new structure before the tree is built, so that with the throw
    /// switch on an exception leaves it with the host, who then owns what was built.
    static void MakeVizProductStructure(TarvexPSImportResult const& result,
                                        TarvexInputProductStructure const& input,
                                        TarvexDocument& document, VizProductStructure*& out);
    /// One part around a container that the host already has; document strings from the
    /// import library. The structure takes ownership of `container`.
    static void MakeVizProductStructure(TarvexPSImportResult const& result,
                                        TarvexInputProductStructure const& input,
                                        TarvexDocument& document, VizPartContainer* container,
                                        VizProductStructure*& out);
    /// One part around a container, with document strings from the host and nothing from
    /// the import library. A null container leaves `out` null and takes nothing.
    static void MakeVizProductStructure(VizDocumentInfo const& info, VizPartContainer* container,
                                        VizProductStructure*& out);

    VizBuilder(VizProductStructure& structure, TarvexInputProductStructure const& input,
               TarvexPolicy* policy);
    /// Member-wise: the copy works on the same structure and input with the same settings,
    /// and shares the visual id map's state, including the elements it keeps alive.
    VizBuilder(VizBuilder const&) = default;
    VizBuilder& operator=(VizBuilder const&) = delete; // it holds references
    ~VizBuilder() = default;

    /// Runs the instance data, graphical data and assembly data phases, in this order.
    /// Always true: failures are in VizProductStructure::GetErrorMessages.
    bool ImportAndBuildPS();

    void SetImportPMI(bool const& importPMI) { m_importPMI = importPMI; }
    void SetImportVisu(bool const& importVisu) { m_importVisu = importVisu; }
    /// Not owned; null means that no BREP can be imported.
    void SetModelerServices(VizModelerServices* services) { m_modelerServices = services; }
    void SetProgressCallback(ProgressCallback callback) { m_progressCallback = callback; }

    /// Seconds spent in the modeler's imports.
    double GetTotalImportBrepTime() const { return m_totalImportBrepTime; }
    /// Seconds spent importing visualisation data.
    double GetTotalImportGeomTime() const { return m_totalImportGeomTime; }
    /// Seconds spent importing the product-level PMI data.
    double GetTotalImportSemanticPMITime() const { return m_totalImportSemanticPMITime; }
    int GetNumberOfProcessorsUsed() const { return m_numberOfProcessorsUsed; }

private:
    friend class VizBuilderTestPeer; // lets the tests reach the entity walk directly
    /// `ancestors` holds the sub-assemblies from the root down to `reference`: a child that
    /// stands among them would contain itself and is refused as a failure of that child.
    static void loadReferenceStructure(VizProductStructure& structure,
                                       TarvexInputPSReference const& reference, VizPSEntry* parent,
                                       std::vector<int>& ancestors);
    /// A new structure named after the input's product, handed to the caller through `out`
    /// before anything else is done, so that with the throw switch on the host owns what an
    /// exception leaves behind.
    static VizProductStructure& newStructure(TarvexInputProductStructure const& input,
                                             VizProductStructure*& out);
    /// The one entry of a structure made around a single part, under the reference id 1, and
    /// its container, which may be null.
    static void addSinglePart(VizProductStructure& structure, WString const& name,
                              std::unique_ptr<VizPartContainer> container);
    static bool defineMissingFile(VizProductStructure& structure, int const& id,
                                  TarvexInputPSReference const& reference);
    static void getDocumentInfo(TarvexDocument& document, VizProductStructure& structure);
    static void setConfigurationAndUnits(TarvexInputProductStructure const& input,
                                         VizProductStructure& structure);

    void resetTimers();
    void loadProductStructureInstanceData();
    void loadProductStructureGraphicalData();
    void loadProductStructureAssemblyData();

    // Instance data phase.
    void importContainersFromTarvex_SingleProc();
    void importContainersFromTarvex_MultiProc(int const& total);
    void defineReference(TarvexInputPSReference const& reference, int* counter);
    /// `ancestors` as for loadReferenceStructure: a sub-assembly that contains itself was
    /// reported when the tree was built and is passed over here.
    void defineReference(TarvexInputPSReference const& reference, int* counter,
                         std::vector<int>& ancestors);
    void importBREPFromReference(TarvexInputPSReference const& reference,
                                 SemanticPMIByReference& semanticPMI);
    VizPartContainer* getVizPartContainerFromReference(TarvexInputPSReference const& reference,
                                                       TarvexEntity entity, WString& path);
    void importVisuDataFromReference(TarvexInputPSReference const& reference);
    /// Makes the containers that m_importVisu / m_importPMI ask for and fills them from
    /// `data`. Both out-arguments come in null; a container handed out is the caller's.
    /// When a throw ends the walk, the containers are freed and every visual id the walk
    /// entered is put back as it was.
    void importGraphicalContainer(int const& referenceId, TarvexVisualizationData const& data,
                                  VizContainer*& vizContainer, VizPMIContainer*& pmiContainer);
    /// Loads one leaf into the list its type and geometry type choose; `journal` takes the
    /// visual ids it enters.
    void processVizLeaf(VizContainer* vizContainer, VizPMIContainer* pmiContainer,
                        TarvexVisuNode const& node, std::vector<TarvexVisuAttributes>& attributes,
                        TarvexVisuNode::TarvexVisuNodeType const& nodeType,
                        VisuIdMapJournal& journal);
    /// The element entered under `visualId`, or null; the lookup adds nothing.
    VizElement* GetVizElement(WString const& visualId) const;
    /// The mechanical id of the mesh, face, edge or PMI entered under `visualId`; empty
    /// for anything else.
    WString GetVizElementMechID(WString const& visualId) const;
    /// Gives each PMI of `container` the mechanical ids of its linked elements.
    void FillVizPMIMechIDs(VizPMIContainer* container) const;
    void processSemanticPMI(TarvexPMIData& data, SemanticPMIByReference& semanticPMI);
    /// Gives every inner map's records to the structure and frees the inner maps.
    void handOverSemanticPMI(SemanticPMIBatch& batch);

    /// Calls the progress callback, if one is set, with `text` (null: no text).
    void reportProgress(int const& current, int const& total, WString const* text) const;
    /// "Importing <modeler name> BREP from <name>".
    WString brepProgressText(WString const& referenceName) const;

    VizProductStructure& m_productStructure;                    ///< not owned
    TarvexInputProductStructure const& m_inputProductStructure; ///< not owned
    VizModelerServices* m_modelerServices = nullptr;            ///< not owned
    TarvexPolicy* m_policy;                                     ///< not owned; may be null
    ProgressCallback m_progressCallback = nullptr;
    bool m_importVisu = false;
    bool m_importPMI = false;
    double m_totalImportBrepTime = 0.0;
    double m_totalImportSemanticPMITime = 0.0;
    double m_totalImportGeomTime = 0.0;
    int m_numberOfProcessorsUsed = 1;
    std::map<WString, VizElement*> m_visuIdMap; ///< elements not owned
    /// Elements that a leaf loaded but that stand in no container: the first load of a
    /// constructed geometry for FTA. Kept as long as m_visuIdMap, or a copy's, may point into
    /// them: shared with the copies of this builder.
    std::shared_ptr<std::vector<std::unique_ptr<VizElement>>> m_unlistedElements =
        std::make_shared<std::vector<std::unique_ptr<VizElement>>>();
};

} // namespace VizBridgeTarvex
