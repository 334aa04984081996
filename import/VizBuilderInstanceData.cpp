// The instance data phase of VizBuilder: every reference of the tree is imported, in the
// caller's process along the tree, or as the import library's spooler delivers it.

#include <VizBridge/contracts/kolba/Stopwatch.h>
#include <VizBridge/contracts/platform/DebugOutput.h>
#include <VizBridge/contracts/platform/FormatW.h>
#include <VizBridge/contracts/platform/Sleep.h>
#include <VizBridge/contracts/tarvex/TarvexEntity.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSInstance.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexInstanceEntity.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcess.h>
#include <VizBridge/contracts/tarvex/TarvexMultiProcessSpooler.h>
#include <VizBridge/contracts/tarvex/TarvexPMIData.h>
#include <VizBridge/contracts/tarvex/TarvexPartDocument.h>
#include <VizBridge/contracts/tarvex/TarvexPartImportResult.h>
#include <VizBridge/import/BuilderErrors.h>
#include <VizBridge/import/SemanticPMIBatch.h>
#include <VizBridge/import/VizBuilder.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/model/VizPartContainer.h>
#include <VizBridge/model/VizProductStructure.h>
#include <VizBridge/services/VizModelerServices.h>

#include <algorithm>

namespace VizBridgeTarvex {

using namespace BuilderErrors;

namespace {
/// Stops `stopwatch` if it still runs and adds what it measured to `total`.
void stopInto(KolbaVizCore::Stopwatch& stopwatch, double& total) {
    if (!stopwatch.IsRunning())
        return;
    stopwatch.Stop();
    total += stopwatch.GetElapsedTime();
}
} // namespace

void VizBuilder::loadProductStructureInstanceData() {
    if (!m_importVisu && !m_modelerServices) {
        // Each part then fails with a text that gives no reason: say it once, here.
        VizPort::OutputDebugStringW(
            u"VizBuilder: no modeler services are set, so no BREP part can be imported");
    }
    int const references = m_inputProductStructure.GetUniqueReferencesCount();
    int const toUse = TarvexMultiProcess::GetNumberOfProcessorsToUse();
    int const physical = TarvexMultiProcess::GetNumberOfPhysicalProcessors();
    if (references == 1 || m_importVisu || toUse == 1 || physical == 1) {
        m_numberOfProcessorsUsed = 1;
        importContainersFromTarvex_SingleProc();
        return;
    }
    m_numberOfProcessorsUsed = toUse == 0 ? physical : toUse;
    importContainersFromTarvex_MultiProc(references);
}

void VizBuilder::importContainersFromTarvex_MultiProc(int const& total) {
    int progress = 0;
    reportProgress(0, total, nullptr);

    SemanticPMIBatch semanticPMI;
    KolbaVizCore::Stopwatch stopwatch; // the polling passes, without sleeps and imports
    stopwatch.Start();
    {
        TarvexMultiProcessSpooler spooler(m_inputProductStructure);
        spooler.InitiateConversion(TarvexRep_BREP);
        while (!spooler.IsComplete()) {
            if (stopwatch.IsRunning())
                stopwatch.Stop();
            VizPort::Sleep(1);
            stopwatch.Start();

            unsigned int id = 0;
            if (!spooler.HasDataAvailableFor(id))
                continue;
            TarvexRep const representation = spooler.GetActiveRepresentation();
            TarvexInputPSReference const reference =
                m_inputProductStructure.GetReferenceFromId(static_cast<int>(id));
            unsigned int const unique = reference.GetUniqueID();
            if (unique != id) {
                // Only worth a note: the reference's own id is the one used from here on.
                WString const note = VizPort::FormatW(512, u"MISMATCHING REFERENCE IDS\n", {});
                VizPort::OutputDebugStringW(note.c_str());
            }
            int const referenceId = static_cast<int>(unique);
            if (defineMissingFile(m_productStructure, referenceId, reference))
                continue;
            if (stopwatch.IsRunning())
                stopwatch.Stop();
            if (representation != TarvexRep_BREP)
                continue;
            if (m_progressCallback) {
                ++progress;
                WString const text = brepProgressText(textOrEmpty(reference.GetReferenceName()));
                reportProgress(progress, total, &text);
            }
            importBREPFromReference(reference, semanticPMI.map());
        }
    }
    if (stopwatch.IsRunning())
        stopwatch.Stop();
    m_totalImportBrepTime += stopwatch.GetElapsedTime();

    // No PMI container exists yet in this phase, so the records find no taker; without
    // PMI import they are not even offered. Either way the batch frees what is left.
    if (m_importPMI)
        handOverSemanticPMI(semanticPMI);
}

void VizBuilder::importContainersFromTarvex_SingleProc() {
    int const references = m_inputProductStructure.GetUniqueReferencesCount();
    reportProgress(0, references, nullptr);
    int counter = 0;
    int const roots = m_inputProductStructure.GetRootInstancesCount();
    for (int i = 0; i < roots; ++i) {
        TarvexInputPSInstance const instance = m_inputProductStructure.GetRootInstance(i);
        defineReference(instance.GetReference(), &counter);
    }
    reportProgress(references, references, nullptr);
}

void VizBuilder::defineReference(TarvexInputPSReference const& reference, int* counter) {
    std::vector<int> ancestors;
    defineReference(reference, counter, ancestors);
}

void VizBuilder::defineReference(TarvexInputPSReference const& reference, int* counter,
                                 std::vector<int>& ancestors) {
    int const id = static_cast<int>(reference.GetUniqueID());
    WString const name = textOrEmpty(reference.GetReferenceName());
    int const current = counter ? *counter + 1 : 0;
    int const total = m_productStructure.GetContainerCount();

    if (defineMissingFile(m_productStructure, id, reference))
        return;

    if (!reference.IsPart()) {
        int const count = reference.GetInstancesCount();
        if (count < 1) {
            if (m_progressCallback) {
                WString const text = u"Empty or invalid reference " + name;
                reportProgress(current, total, &text);
            }
            return;
        }
        if (std::find(ancestors.begin(), ancestors.end(), id) != ancestors.end())
            return;
        ancestors.push_back(id);
        for (int i = 0; i < count; ++i)
            defineReference(reference.GetInstance(i).GetReference(), counter, ancestors);
        ancestors.pop_back();
        return;
    }

    SemanticPMIBatch semanticPMI;
    bool imported = false;
    bool const wantBREP = !m_importVisu;
    bool wantViz = m_importVisu || m_importPMI;

    if (wantBREP) {
        if (!m_productStructure.IsBREPLoaded(id)) {
            if (m_progressCallback) {
                WString const text = brepProgressText(name);
                reportProgress(current, total, &text);
            }
            importBREPFromReference(reference, semanticPMI.map());
            imported = true;
            // With BREP, visualisation data is only wanted for the PMI of parts that have it.
            if (wantViz && semanticPMI.empty())
                wantViz = false;
        } else if (wantViz && !m_productStructure.IsSemanticInfoLoaded(id)) {
            wantViz = false;
        }
    }

    if (wantViz && !m_productStructure.IsVizLoaded(id)) {
        if (m_progressCallback) {
            WString const text = u"Importing VisuData from " + name;
            reportProgress(current, total, &text);
        }
        importVisuDataFromReference(reference);
        imported = true;
    }

    handOverSemanticPMI(semanticPMI);

    // Counted after the part's work, so its BREP and visualisation messages share `current`.
    if (m_progressCallback && imported && counter)
        ++*counter;
}

void VizBuilder::importBREPFromReference(TarvexInputPSReference const& reference,
                                         SemanticPMIByReference& semanticPMI) {
    KolbaVizCore::Stopwatch stopwatch;
    stopwatch.Start();
    int id = 0;
    try {
        // Read inside the guard: a reference that cannot even be read costs only itself.
        id = static_cast<int>(reference.GetUniqueID());
        WString const name = textOrEmpty(reference.GetReferenceName());
        TarvexPartDocument document = reference.GetDocument();
        TarvexPartImportResult result;
        VizPartContainer* container = nullptr;
        WString error;

        bool const ok = m_modelerServices && m_modelerServices->ImportPart(
                                                 id, document, result, container, m_policy, error);
        stopInto(stopwatch, m_totalImportBrepTime);

        if (ok && container) {
            // Stored before the PMI is read: a failure there leaves the container in place.
            m_productStructure.AddVizPartContainer(id,
                                                   std::unique_ptr<VizPartContainer>(container));
            TarvexPMIData data = result.GetPMIData();
            processSemanticPMI(data, semanticPMI);
            return;
        }
        // A container left behind with a false answer stays the modeler's.
        reportDebugError(id, error);
        WString message = u"Could not import Part '" + name + u"'.";
        if (!error.empty())
            message += u" Failed with error : " + error;
        m_productStructure.setImportError(id, message);
    } catch (...) {
        stopInto(stopwatch, m_totalImportBrepTime);
        m_productStructure.setImportError(id, describeCurrentFailure(kPartImportSite, id).text);
    }
}

VizPartContainer*
VizBuilder::getVizPartContainerFromReference(TarvexInputPSReference const& reference,
                                             TarvexEntity entity, WString& path) {
    if (reference.IsPart())
        return m_productStructure.GetVizPartContainer(static_cast<int>(reference.GetUniqueID()));
    TarvexInstanceEntity instanceEntity;
    if (!entity.GetInstanceEntity(instanceEntity))
        return nullptr;
    TarvexInputPSInstance const instance = instanceEntity.GetInstance();
    WString const instanceName = textOrEmpty(instance.GetInstanceName());
    path = path.empty() ? instanceName : path + u"/" + instanceName;
    return getVizPartContainerFromReference(instance.GetReference(), instanceEntity.GetEntity(),
                                            path);
}

void VizBuilder::processSemanticPMI(TarvexPMIData& /*data*/,
                                    SemanticPMIByReference& /*semanticPMI*/) {
    // Not built yet: the import library's PMI objects and the semantic loaders are still to
    // come, so a part gives no semantic PMI records.
}

void VizBuilder::handOverSemanticPMI(SemanticPMIBatch& batch) {
    for (auto& [id, records] : batch.map()) {
        if (!records)
            continue;
        m_productStructure.AddSemanticPMI(id, records); // empties `records`
        delete records;
        records = nullptr;
    }
    batch.map().clear();
}

void VizBuilder::reportProgress(int const& current, int const& total, WString const* text) const {
    if (m_progressCallback)
        m_progressCallback(current, total, text ? text->c_str() : nullptr);
}

WString VizBuilder::brepProgressText(WString const& referenceName) const {
    WString const modeler = m_modelerServices ? m_modelerServices->GetName() : WString();
    return u"Importing " + modeler + u" BREP from " + referenceName;
}

} // namespace VizBridgeTarvex
