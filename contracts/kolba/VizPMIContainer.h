#pragma once

#include <VizBridge/contracts/kolba/AVizContainer.h>
#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/kolba/OwnedPointers.h>
#include <VizBridge/contracts/kolba/SemanticPMI.h>
#include <VizBridge/contracts/kolba/VizCapture.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPMI.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizView.h>
#include <VizBridge/contracts/kolba/VizWire.h>

#include <map>
#include <memory>
#include <vector>

namespace KolbaVizCore {

/// PMI of one reference: its PMI objects, its constructed geometry for functional
/// tolerancing (FTA CG meshes, wires and point sets), its views and captures, each in a
/// list in the order of adding, and the semantic records of its PMI objects, filed by ID.
/// Owns all of them, so it cannot be copied.
class VizPMIContainer : public AVizContainer {
public:
    explicit VizPMIContainer(int const& refId) : AVizContainer(refId) {}
    // Owns its records: a copy would free them twice.
    VizPMIContainer(VizPMIContainer const&) = delete;
    VizPMIContainer& operator=(VizPMIContainer const&) = delete;

    std::string GetTypeName() const override { return "VizPMIContainer"; }
    /// The PMI object, PMI edge, face or text, FTA element, view or capture that `view`
    /// picks along `ray`: the one drawn deepest above the picked node (see pickAmong). The
    /// element stays the container's.
    bool PickVisual(AView3DAdapter* view, Ray const& ray, VizElement*& element) override;

    /// Factor from the data's length unit to the scene's.
    void SetScaleFactor(double const& factor) { m_scaleFactor = factor; }
    double GetScaleFactor() const { return m_scaleFactor; }

    // Each Add takes over its element; null is ignored.
    void AddVizPMI(VizPMI* pmi) { m_pmis.Add(pmi); }
    void AddVizFTACGMesh(VizMesh* mesh) { m_ftaMeshes.Add(mesh); }
    void AddVizFTACGWire(VizWire* wire) { m_ftaWires.Add(wire); }
    void AddVizFTACGPointSet(VizPointSet* set) { m_ftaPointSets.Add(set); }
    void AddView(VizView* view) { m_views.Add(view); }
    void AddCapture(VizCapture* capture) { m_captures.Add(capture); }

    std::vector<VizPMI*> const& GetVizPMIs() const { return m_pmis.Get(); }
    std::vector<VizMesh*> const& GetVizFTACGMeshes() const { return m_ftaMeshes.Get(); }
    std::vector<VizWire*> const& GetVizFTACGWires() const { return m_ftaWires.Get(); }
    std::vector<VizPointSet*> const& GetVizFTACGPointSets() const { return m_ftaPointSets.Get(); }
    std::vector<VizView*> const& GetViews() const { return m_views.Get(); }
    std::vector<VizCapture*> const& GetCaptures() const { return m_captures.Get(); }

    /// The first PMI object, in the order of adding, whose mechanical id is `mechanicalId`
    /// (the ID its semantic record is filed under); null if there is none or the id is empty.
    /// The object stays the container's.
    VizPMI* GetVizPMI(VizPort::WString const& mechanicalId) const;
    /// True and, in `links`, the model entities that the semantic record under
    /// `mechanicalId` is linked to; otherwise false and `links` untouched.
    bool GetBREPLinks(VizPort::WString const& mechanicalId, std::vector<EntityId>& links) const;
    /// True and, in `links`, the mechanical ids of the PMI objects of this container that
    /// the PMI object `mechanicalId` points at, in the order of its links, each once;
    /// otherwise (no such object) false and `links` untouched.
    bool GetPMILinks(VizPort::WString const& mechanicalId,
                     std::vector<VizPort::WString>& links) const;

    bool HasSemanticPMI() const { return !m_semanticPMI.empty(); }
    /// Takes ownership of `record`, filed under its ID. A record with the same ID that
    /// was there before is freed. A null record is ignored.
    void AddSemanticPMI(SemanticPMI* record);
    /// True and the record (still the container's) if one is filed under `key`;
    /// otherwise false and `out` untouched.
    bool GetSemanticPMI(VizPort::WString const& key, SemanticPMI*& out) const;
    /// True and SemanticPMI::ToString of the record under `key`; otherwise false and
    /// `text` untouched.
    bool GetSemanticPMIAsString(VizPort::WString const& key, VizPort::WString& text) const;
    int GetNumberOfSemanticPMI() const { return static_cast<int>(m_semanticPMI.size()); }

private:
    double m_scaleFactor = 1.0;
    OwnedPointers<VizPMI> m_pmis;
    OwnedPointers<VizMesh> m_ftaMeshes;
    OwnedPointers<VizWire> m_ftaWires;
    OwnedPointers<VizPointSet> m_ftaPointSets;
    OwnedPointers<VizView> m_views;
    OwnedPointers<VizCapture> m_captures;
    std::map<VizPort::WString, std::unique_ptr<SemanticPMI>> m_semanticPMI;
};

} // namespace KolbaVizCore
