#pragma once

#include <VizBridge/model/SemanticPMIMaps.h>
#include <VizBridge/model/VizDocumentInfo.h>
#include <VizBridge/model/VizTypes.h>

#include <map>
#include <memory>
#include <vector>

namespace KolbaVizCore {
class AView3DAdapter;
class VizCapture;
class VizView;
struct Ray;
} // namespace KolbaVizCore

namespace VizBridgeTarvex {

class VizBuilder;
class VizContainerStore;
class VizPartContainer;
class VizPSEntry;

/// The result of an import and the input of a render: the document strings, the tree of
/// instances, per reference the containers of what was loaded, and every failure.
///
/// Created by VizBuilder::MakeVizProductStructure, which hands it to the host; the host
/// deletes it after every builder and renderer on it. It owns all its entries and, with its
/// copies, all its containers.
///
/// Copies: a copy has an instance tree of its own (the same names, flags, placements and
/// render ids, its entries pointing at the copy) and shares the containers with the
/// structure it was copied from, which either may outlive.
class VizProductStructure : private VizDocumentInfo {
public:
    VizProductStructure(VizProductStructure const& other);
    VizProductStructure& operator=(VizProductStructure const& other);
    /// Frees the tessellated containers, the PMI containers and the part containers, unless
    /// a copy still holds them, and then the entries.
    ~VizProductStructure();

    // Document strings.
    WString GetProductName() const { return productName; }
    WString GetFormatType() const { return formatType; }
    WString GetAuthor() const { return author; }
    WString GetOrganization() const { return organization; }
    WString GetVersion() const { return version; }
    WString GetDocumentUnits() const { return documentUnits; }
    WString GetSourceSystem() const { return sourceSystem; }
    WString GetComment() const { return comment; }
    WString GetFileName() const { return fileName; }
    /// The product name of an imported structure; empty for one made from host data.
    WString GetConfigurationName() const { return m_configurationName; }
    /// The length unit of the input product structure, as text.
    WString GetUnits() const { return m_units; }

    // Tree.
    std::vector<VizPSEntry*> const& GetChildren() const { return m_rootEntries; }
    /// The first entry built for reference `id`, or null.
    VizPSEntry* GetSubAssembly(int const& id) const;

    // Containers, by reference id (0: the product level). A lookup never adds a key; an
    // absent key gives null.
    std::map<int, VizPartContainer*> const& GetAllVizPartContainers() const;
    std::map<int, VizContainer*> const& GetAllVizContainers() const;
    std::map<int, VizPMIContainer*> const& GetAllVizPMIContainers() const;
    VizPartContainer* GetVizPartContainer(int const& id) const;
    VizContainer* GetVizContainer(int const& id) const;
    VizPMIContainer* GetVizPMIContainer(int const& id) const;
    int GetNumberOfVizPartContainers() const;
    int GetNumberOfVizContainers() const;
    int GetNumberOfVizPMIContainers() const;
    int GetContainerCount() const { return m_containerCount; }

    // State.
    bool IsLoaded(int const& id) const { return m_subAssemblies.count(id) != 0; }
    bool IsVizLoaded(int const& id) const;
    bool IsBREPLoaded(int const& id) const;
    bool IsSemanticInfoLoaded(int const& id) const;
    /// Nothing in the system sets these two: they stay false.
    bool IsAllBREPLoaded() const { return m_allBREPLoaded; }
    bool IsAllVizLoaded() const { return m_allVizLoaded; }
    bool IsTesselatingText() const { return m_tesselatingText; }
    /// True and the storage name if reference `id` was found missing; else `name` stays.
    bool IsMissingFile(int const& id, WString& name) const;

    /// Whether PMI texts are tessellated into strokes and glyphs. Read when text elements
    /// are loaded: set it before VizBuilder::ImportAndBuildPS.
    void SetTesselatingText(bool tesselate) { m_tesselatingText = tesselate; }

    // Failures.
    std::vector<WString> GetMissingFiles() const { return m_missingFiles; }
    /// Import errors by reference id, then visualisation errors by reference id, then
    /// "Missing File " and each missing file name.
    std::vector<WString> GetErrorMessages() const;

    // Semantic PMI. The first container in reference id order that knows `key` answers.
    /// The record stays the container's.
    bool GetSemanticPMI(WString const& key, SemanticPMI*& out) const;
    /// Empty when no container knows `key`.
    WString GetSemanticPMIAsString(WString const& key) const;

    /// Takes the first pair in key order that holds `container` out of the map, for this
    /// structure and its copies, and gives ownership back to the caller. A pointer that is
    /// not in the map changes nothing.
    void RemoveVizPartContainer(VizPartContainer* container);
    void RemoveVizPMIContainer(VizPMIContainer* container);

    // After a render, without the renderer.
    /// What lies under `ray`: in `element` the element hit, asked of the PMI containers
    /// first and of the tessellated containers only if no PMI was hit; in `entry` the
    /// deepest entry whose render id begins the path the view picked (of two as deep, the
    /// first in tree order). Either stays as it was when nothing is found; the caller sets
    /// both to null before. True if either was found; false for a null view.
    bool PickVisual(KolbaVizCore::AView3DAdapter* view, KolbaVizCore::Ray const& ray,
                    VizElement*& element, VizPSEntry*& entry) const;
    /// Makes `capture` active or not, switches every other view and capture of the
    /// containers off, and shows the PMI that the active capture holds in its own container.
    /// If nothing at all was active before, every PMI is shown; if something was but nothing
    /// is now, every PMI stays hidden. `capture` need not stand in a container. Always true.
    bool SetActive(KolbaVizCore::VizCapture& capture, bool const& active);
    /// The same for a view: the PMI that the active view holds are shown.
    bool SetActive(KolbaVizCore::VizView& view, bool const& active);

    /// "Product: " and the product name, then the tree, one line per entry.
    WString ToString() const;

private:
    friend class VizBuilder;
    friend class VizProductStructureTestPeer; // lets the tests fill a structure directly
    explicit VizProductStructure(char16_t const* productName);

    void SetContainerCount(int count) { m_containerCount = count; }
    /// A null entry is ignored. Sets the entry's structure to this one.
    void AddRootEntry(VizPSEntry* entry);
    /// A null entry is ignored. Sets the entry's structure and takes ownership; never
    /// replaces an entry under the same id. Each entry may be added once.
    void AddSubAssembly(int const& id, std::unique_ptr<VizPSEntry> entry);
    /// Take ownership and set the value under `id`; a null container stands there as null.
    /// A different container that stood under `id` stays owned by the structure until it is
    /// destroyed, so pointers to it and its elements that were handed out stay valid.
    void AddVizPartContainer(int const& id, std::unique_ptr<VizPartContainer> container);
    void AddVizContainer(int const& id, std::unique_ptr<VizContainer> container);
    void AddVizPMIContainer(int const& id, std::unique_ptr<VizPMIContainer> container);
    /// Hands every non-null record of `records`, in key order, to the PMI container of
    /// `id`. Records that no container takes are freed. On return `records` is empty; the
    /// map itself stays the caller's. A null map does nothing.
    void AddSemanticPMI(int const& id, SemanticPMIByKey* records);

    void addMissingFile(WString const& name) { m_missingFiles.push_back(name); }
    void addMissingReference(int const& id, WString const& storageName) {
        m_missingReferences[id] = storageName;
    }
    /// Key 0 collects product-level failures one after the other; every other key keeps
    /// the last text.
    void appendImportError(int const& id, WString const& text) { m_importErrors[id] += text; }
    void setImportError(int const& id, WString const& text) { m_importErrors[id] = text; }
    void setVisuError(int const& id, WString const& text) { m_visuErrors[id] = text; }
    void assignDocumentInfo(VizDocumentInfo const& info) {
        static_cast<VizDocumentInfo&>(*this) = info;
    }
    void setConfigurationName(WString const& name) { m_configurationName = name; }
    void setUnits(WString const& units) { m_units = units; }
    std::vector<WString> const& missingFiles() const { return m_missingFiles; }
    /// Gives this structure copies of the entries of `other`, re-pointed at this one.
    void copyEntries(VizProductStructure const& other);

    WString m_configurationName;
    WString m_units;
    int m_containerCount = 0;
    bool m_allBREPLoaded = false;
    bool m_allVizLoaded = false;
    bool m_tesselatingText = false;
    std::vector<VizPSEntry*> m_rootEntries; ///< not owned: m_subAssemblies' entries
    /// Every entry, under its reference id; equal keys in the order they were added.
    std::multimap<int, std::unique_ptr<VizPSEntry>> m_subAssemblies;
    std::vector<WString> m_missingFiles;
    std::map<int, WString> m_missingReferences;
    std::map<int, WString> m_importErrors;
    std::map<int, WString> m_visuErrors;
    /// The containers and their maps, shared with the copies. Declared last, so that the
    /// containers go before the entries.
    std::shared_ptr<VizContainerStore> m_containers;
};

} // namespace VizBridgeTarvex
