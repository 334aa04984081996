#include <VizBridge/import/VizBuilder.h>

#include <VizBridge/contracts/kolba/AllowThrow.h>
#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexDocument.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSInstance.h>
#include <VizBridge/contracts/tarvex/TarvexInputPSReference.h>
#include <VizBridge/contracts/tarvex/TarvexInputProductStructure.h>
#include <VizBridge/contracts/tarvex/TarvexLengthUnitUtils.h>
#include <VizBridge/contracts/tarvex/TarvexPSImportResult.h>
#include <VizBridge/import/BuilderErrors.h>
#include <VizBridge/import/VizPSInstanceBuilder.h>
#include <VizBridge/loaders/TarvexValues.h>
#include <VizBridge/model/VizPSEntry.h>
#include <VizBridge/model/VizPartContainer.h>
#include <VizBridge/model/VizProductStructure.h>

#include <algorithm>
#include <memory>
#include <stdexcept>

namespace VizBridgeTarvex {

using namespace BuilderErrors;

namespace {

/// A new entry for `instance` of `reference`, owned by the caller.
std::unique_ptr<VizPSEntry> makeEntry(TarvexInputPSInstance const& instance,
                                      TarvexInputPSReference const& reference) {
    VizPSEntry* entry = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(instance, reference, entry);
    return std::unique_ptr<VizPSEntry>(entry);
}

} // namespace

// ---------------------------------------------------------------------------------------------
// The instance tree

void VizBuilder::addSinglePart(VizProductStructure& structure, WString const& name,
                               std::unique_ptr<VizPartContainer> container) {
    VizPSEntry* made = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(1, name, made);
    std::unique_ptr<VizPSEntry> entry(made);
    VizPSEntry* const root = entry.get();
    structure.AddSubAssembly(1, std::move(entry));
    structure.AddRootEntry(root);
    structure.AddVizPartContainer(1, std::move(container));
}

VizProductStructure& VizBuilder::newStructure(TarvexInputProductStructure const& input,
                                              VizProductStructure*& out) {
    TarvexWString const productName = input.GetProductName();
    char16_t const* name = nullptr;
    productName.ToWChar(name);
    out = new VizProductStructure(name); // the host owns it from here on
    return *out;
}

void VizBuilder::MakeVizProductStructure(TarvexPSImportResult const& result,
                                         TarvexInputProductStructure const& input,
                                         TarvexDocument& document, VizProductStructure*& out) {
    VizProductStructure& structure = newStructure(input, out);
    getDocumentInfo(document, structure);

    // Before any instance: defineMissingFile reads the list.
    TarvexInputPSMissingFileIter missingFiles = result.GetMissingFileIterator();
    if (missingFiles.GetCount() != 0) {
        while (missingFiles.Next())
            structure.addMissingFile(textOrEmpty(missingFiles.Current()));
    }

    structure.SetContainerCount(input.GetUniqueReferencesCount());

    int const rootCount = input.GetRootInstancesCount();
    for (int i = 0; i < rootCount; ++i) {
        int id = 0;
        TarvexInputPSReference reference;
        VizPSEntry* root = nullptr;
        // A root is guarded like a child, so that with the throw switch off a root that
        // cannot be read costs only itself. With the switch on nothing here catches: the
        // exception reaches the caller as it came.
        try {
            TarvexInputPSInstance const instance = input.GetRootInstance(i);
            reference = instance.GetReference();
            bool const isPart = reference.IsPart();
            id = static_cast<int>(reference.GetUniqueID());
            int const instanceCount = reference.GetInstancesCount();
            bool const missing = defineMissingFile(structure, id, reference);
            if (!missing && !isPart && instanceCount < 1)
                continue; // an empty sub-assembly gets no entry
            std::unique_ptr<VizPSEntry> entry = makeEntry(instance, reference);
            root = entry.get();
            structure.AddSubAssembly(id, std::move(entry));
            structure.AddRootEntry(root);
            if (isPart)
                continue;
        } catch (...) {
            if (KolbaVizCore::GetAllowThrow())
                throw;
            structure.appendImportError(id,
                                        describeCurrentFailure(kStructureInstanceSite, id).text);
            continue;
        }
        std::vector<int> ancestors{id};
        loadReferenceStructure(structure, reference, root, ancestors);
    }

    setConfigurationAndUnits(input, structure);
}

void VizBuilder::MakeVizProductStructure(TarvexPSImportResult const& /*result*/,
                                         TarvexInputProductStructure const& input,
                                         TarvexDocument& document, VizPartContainer* container,
                                         VizProductStructure*& out) {
    // Ours from the call on: an exception before it is stored frees it. A null container
    // stands under the part's id as null.
    std::unique_ptr<VizPartContainer> owned(container);
    VizProductStructure& structure = newStructure(input, out);
    getDocumentInfo(document, structure);
    structure.SetContainerCount(1);
    addSinglePart(structure, structure.GetProductName(), std::move(owned));
    setConfigurationAndUnits(input, structure);
}

void VizBuilder::MakeVizProductStructure(VizDocumentInfo const& info, VizPartContainer* container,
                                         VizProductStructure*& out) {
    out = nullptr;
    if (!container)
        return;
    std::unique_ptr<VizPartContainer> owned(container);

    out = new VizProductStructure(info.productName.c_str()); // the host owns it from here on
    VizProductStructure& structure = *out;
    structure.assignDocumentInfo(info);
    structure.SetContainerCount(1);
    addSinglePart(structure, info.productName, std::move(owned));

    WString units;
    if (textOf(TarvexLengthUnitUtils::LengthUnitToString(TarvexLengthUnit_Unknown), units))
        structure.setUnits(units);
}

void VizBuilder::loadReferenceStructure(VizProductStructure& structure,
                                        TarvexInputPSReference const& reference, VizPSEntry* parent,
                                        std::vector<int>& ancestors) {
    if (!parent)
        return;
    int const count = reference.GetInstancesCount();
    for (int i = 0; i < count; ++i) {
        int id = 0;
        try {
            TarvexInputPSInstance const instance = reference.GetInstance(i);
            TarvexInputPSReference const child = instance.GetReference();
            bool const isPart = child.IsPart();
            int const instanceCount = child.GetInstancesCount();
            id = static_cast<int>(child.GetUniqueID());
            bool const missing = defineMissingFile(structure, id, child);
            if (!missing && !isPart && instanceCount < 1)
                continue;
            if (!isPart && std::find(ancestors.begin(), ancestors.end(), id) != ancestors.end())
                throw std::runtime_error("Reference contains itself");
            std::unique_ptr<VizPSEntry> entry = makeEntry(instance, child);
            VizPSEntry* const added = entry.get();
            parent->AddChild(added);
            structure.AddSubAssembly(id, std::move(entry));
            // Inside the guard: a failure below is recorded again under this child.
            if (!isPart) {
                ancestors.push_back(id);
                struct PopOnExit {
                    std::vector<int>& path;
                    ~PopOnExit() { path.pop_back(); }
                } const pop{ancestors};
                loadReferenceStructure(structure, child, added, ancestors);
            }
        } catch (...) {
            Failure const failure = describeCurrentFailure(kStructureInstanceSite, id);
            structure.appendImportError(id, failure.text);
            if (KolbaVizCore::GetAllowThrow())
                throw std::runtime_error(failure.what);
        }
    }
}

bool VizBuilder::defineMissingFile(VizProductStructure& structure, int const& id,
                                   TarvexInputPSReference const& reference) {
    WString const storage = textOrEmpty(reference.GetStorageName());
    for (WString const& entry : structure.missingFiles()) {
        if (entry.empty())
            continue;
        // A missing-file entry matches the storage name itself, or a longer path whose
        // only occurrence of the storage name is at its end.
        std::size_t const position = entry.find(storage);
        if (entry == storage ||
            (position != WString::npos && position == entry.size() - storage.size())) {
            structure.addMissingReference(id, storage);
            return true;
        }
    }
    return false;
}

void VizBuilder::getDocumentInfo(TarvexDocument& document, VizProductStructure& structure) {
    TarvexDocumentInformation const information = document.GetInformation();
    using Getter = bool (TarvexDocumentInformation::*)(TarvexWString&) const;
    struct Field {
        Getter get;
        WString VizDocumentInfo::*field;
    };
    static Field const fields[] = {
        {&TarvexDocumentInformation::GetFileName, &VizDocumentInfo::fileName},
        {&TarvexDocumentInformation::GetAuthor, &VizDocumentInfo::author},
        {&TarvexDocumentInformation::GetOrganization, &VizDocumentInfo::organization},
        {&TarvexDocumentInformation::GetSourceSystem, &VizDocumentInfo::sourceSystem},
        {&TarvexDocumentInformation::GetVersion, &VizDocumentInfo::version},
        {&TarvexDocumentInformation::GetUnit, &VizDocumentInfo::documentUnits},
        {&TarvexDocumentInformation::GetComment, &VizDocumentInfo::comment},
        {&TarvexDocumentInformation::GetFormatType, &VizDocumentInfo::formatType},
    };
    for (Field const& field : fields) {
        TarvexWString value;
        if ((information.*field.get)(value))
            textOf(value, structure.*field.field); // present but without text: unchanged
    }
}

void VizBuilder::setConfigurationAndUnits(TarvexInputProductStructure const& input,
                                          VizProductStructure& structure) {
    WString text;
    if (textOf(input.GetProductName(), text))
        structure.setConfigurationName(text);
    if (textOf(TarvexLengthUnitUtils::LengthUnitToString(input.GetUnits()), text))
        structure.setUnits(text);
}

// ---------------------------------------------------------------------------------------------
// The import

VizBuilder::VizBuilder(VizProductStructure& structure, TarvexInputProductStructure const& input,
                       TarvexPolicy* policy)
    : m_productStructure(structure), m_inputProductStructure(input), m_policy(policy) {}

bool VizBuilder::ImportAndBuildPS() {
    resetTimers();
    loadProductStructureInstanceData();
    loadProductStructureGraphicalData();
    loadProductStructureAssemblyData();
    return true; // failures are in the structure's error messages, never here
}

void VizBuilder::resetTimers() {
    m_totalImportBrepTime = 0.0;
    m_totalImportGeomTime = 0.0;
    m_totalImportSemanticPMITime = 0.0;
}

void VizBuilder::loadProductStructureGraphicalData() {
    // Not built yet: the import library's product-level visualisation importer is still to
    // come, so the assembly's own visualisation data is not imported.
}

void VizBuilder::loadProductStructureAssemblyData() {
    // Not built yet: the import library's product-level data importer and the semantic PMI
    // conversion are still to come, so the assembly's own PMI is not imported.
}

} // namespace VizBridgeTarvex
