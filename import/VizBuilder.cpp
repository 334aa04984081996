#include "import/VizBuilder.h"
#include "import/TarvexTexts.h"

#include "contracts/kolba/AllowThrow.h"
#include "contracts/platform/WString.h"
#include "contracts/tarvex/TarvexDocument.h"
#include "contracts/tarvex/TarvexInputPSInstance.h"
#include "contracts/tarvex/TarvexInputPSReference.h"
#include "contracts/tarvex/TarvexInputProductStructure.h"
#include "contracts/tarvex/TarvexLengthUnitUtils.h"
#include "contracts/tarvex/TarvexPSImportResult.h"
#include "import/BuilderErrors.h"
#include "model/VizPSEntry.h"
#include "model/VizPSInstanceBuilder.h"
#include "model/VizPartContainer.h"
#include "model/VizProductStructure.h"

#include <algorithm>
#include <memory>
#include <stdexcept>

namespace VizBridgeTarvex {

using namespace BuilderErrors;

namespace {

/// Records a failure while building the instance tree: the plain text on the debug output,
/// the formatted one appended under `id`. Returns the stored text.
WString recordStructureException(VizProductStructure& structure, int const& id,
                                 std::exception const& e,
                                 void (VizProductStructure::*append)(int const&, WString const&)) {
    reportDebugError(id, VizPort::Widen(e.what() ? e.what() : ""));
    WString text;
    formatExceptionError(u"Product Structure Instance", id, e, text);
    (structure.*append)(id, text);
    return text;
}
} // namespace

// ---------------------------------------------------------------------------------------------
// The instance tree

void VizBuilder::MakeVizProductStructure(TarvexPSImportResult const& result,
                                         TarvexInputProductStructure const& input,
                                         TarvexDocument& document, VizProductStructure*& out) {
    TarvexWString const productName = input.GetProductName();
    char16_t const* name = nullptr;
    productName.ToWChar(name);
    out = new VizProductStructure(name); // the host owns it from here on
    VizProductStructure& structure = *out;

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
        bool descend = false;
        VizPSEntry* entry = nullptr;
        // A root is guarded like a child: with the throw switch off a failing root is
        // recorded and the next one is built. With the switch on the exception reaches the
        // caller unchanged.
        try {
            TarvexInputPSInstance const instance = input.GetRootInstance(i);
            reference = instance.GetReference();
            bool const isPart = reference.IsPart();
            id = static_cast<int>(reference.GetUniqueID());
            int const instanceCount = reference.GetInstancesCount();
            bool const missing = defineMissingFile(structure, id, reference);
            if (!missing && !isPart && instanceCount < 1)
                continue; // an empty sub-assembly gets no entry
            VizPSInstanceBuilder::MakeVizPSInstance(instance, reference, entry);
            if (entry) {
                structure.AddSubAssembly(id, entry);
                structure.AddRootEntry(entry);
                descend = !isPart;
            }
        } catch (std::exception const& e) {
            if (KolbaVizCore::GetAllowThrow())
                throw;
            recordStructureException(structure, id, e, &VizProductStructure::appendImportError);
            continue;
        } catch (...) {
            if (KolbaVizCore::GetAllowThrow())
                throw;
            reportDebugError(id, u"Unknown exception while importing Product Structure");
            WString text;
            formatUnknownError(u"Product Structure Part Import", id, u"Unknown Exception", text);
            structure.appendImportError(id, text);
            continue;
        }
        if (descend) {
            std::vector<int> ancestors{id};
            loadReferenceStructure(structure, reference, entry, ancestors);
        }
    }

    setConfigurationAndUnits(input, structure);
}

void VizBuilder::MakeVizProductStructure(TarvexPSImportResult const& /*result*/,
                                         TarvexInputProductStructure const& input,
                                         TarvexDocument& document, VizPartContainer* container,
                                         VizProductStructure*& out) {
    // Ours from the call on: an exception before it is stored frees it.
    std::unique_ptr<VizPartContainer> owned(container);

    TarvexWString const productName = input.GetProductName();
    char16_t const* name = nullptr;
    productName.ToWChar(name);
    out = new VizProductStructure(name); // the host owns it from here on
    VizProductStructure& structure = *out;

    getDocumentInfo(document, structure);
    structure.SetContainerCount(1);

    VizPSEntry* entry = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(1, structure.GetProductName(), entry);
    if (entry) {
        structure.AddSubAssembly(1, entry);
        structure.AddRootEntry(entry);
        structure.AddVizPartContainer(1, owned.release());
    }

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

    VizPSEntry* entry = nullptr;
    VizPSInstanceBuilder::MakeVizPSInstance(1, info.productName, entry);
    if (entry) {
        structure.AddSubAssembly(1, entry);
        structure.AddRootEntry(entry);
        structure.AddVizPartContainer(1, owned.release());
    }

    WString units;
    if (textOf(TarvexLengthUnitUtils::LengthUnitToString(static_cast<TarvexLengthUnitType>(0)),
               units))
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
            VizPSEntry* entry = nullptr;
            VizPSInstanceBuilder::MakeVizPSInstance(instance, child, entry);
            if (entry) {
                parent->AddChild(entry);
                structure.AddSubAssembly(id, entry);
                // Inside the guard: a failure below is recorded again under this child.
                if (!isPart) {
                    ancestors.push_back(id);
                    struct PopOnExit {
                        std::vector<int>& path;
                        ~PopOnExit() { path.pop_back(); }
                    } const pop{ancestors};
                    loadReferenceStructure(structure, child, entry, ancestors);
                }
            }
        } catch (std::exception const& e) {
            recordStructureException(structure, id, e, &VizProductStructure::appendImportError);
            if (KolbaVizCore::GetAllowThrow())
                throw std::runtime_error(e.what() ? e.what() : "");
        } catch (...) {
            reportDebugError(id, u"Unknown exception while importing Product Structure");
            WString text;
            formatUnknownError(u"Product Structure Part Import", id, u"Unknown Exception", text);
            structure.appendImportError(id, text);
            if (KolbaVizCore::GetAllowThrow())
                throw std::runtime_error(VizPort::Narrow(text));
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

// The product-level phases import what the product-level importers of the import library
// give; until those exist there is nothing at product level to import.
void VizBuilder::loadProductStructureGraphicalData() {}
void VizBuilder::loadProductStructureAssemblyData() {}

} // namespace VizBridgeTarvex
