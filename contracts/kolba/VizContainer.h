#pragma once

#include <VizBridge/contracts/kolba/AVizContainer.h>
#include <VizBridge/contracts/kolba/OwnedPointers.h>
#include <VizBridge/contracts/kolba/VizMesh.h>
#include <VizBridge/contracts/kolba/VizPointSet.h>
#include <VizBridge/contracts/kolba/VizWire.h>

#include <vector>

namespace KolbaVizCore {

/// Tessellated geometry of one reference: meshes, wires and point sets, each as plain
/// geometry and as constructed geometry (CG), in six lists in the order of adding. The
/// container owns every element added to it, so it cannot be copied.
class VizContainer : public AVizContainer {
public:
    explicit VizContainer(int const& refId) : AVizContainer(refId) {}
    VizContainer(VizContainer const&) = delete;
    VizContainer& operator=(VizContainer const&) = delete;

    std::string GetTypeName() const override { return "VizContainer"; }
    /// The mesh, face, edge, wire, point set or group of points, plain or CG, that `view`
    /// picks along `ray`: the one drawn deepest above the picked node (see pickAmong). The
    /// element stays the container's.
    bool PickVisual(AView3DAdapter* view, Ray const& ray, VizElement*& element) override;

    /// Factor from the data's length unit to the scene's.
    void SetScaleFactor(double factor) { m_scaleFactor = factor; }
    double GetScaleFactor() const { return m_scaleFactor; }

    // Each Add takes over its element; null is ignored.
    void AddMesh(VizMesh* mesh) { m_meshes.Add(mesh); }
    void AddCGMesh(VizMesh* mesh) { m_cgMeshes.Add(mesh); }
    void AddWire(VizWire* wire) { m_wires.Add(wire); }
    void AddCGWire(VizWire* wire) { m_cgWires.Add(wire); }
    void AddPointSet(VizPointSet* set) { m_pointSets.Add(set); }
    void AddCGPointSet(VizPointSet* set) { m_cgPointSets.Add(set); }

    std::vector<VizMesh*> const& GetMeshes() const { return m_meshes.Get(); }
    std::vector<VizMesh*> const& GetCGMeshes() const { return m_cgMeshes.Get(); }
    std::vector<VizWire*> const& GetWires() const { return m_wires.Get(); }
    std::vector<VizWire*> const& GetCGWires() const { return m_cgWires.Get(); }
    std::vector<VizPointSet*> const& GetPointSets() const { return m_pointSets.Get(); }
    std::vector<VizPointSet*> const& GetCGPointSets() const { return m_cgPointSets.Get(); }

private:
    double m_scaleFactor = 1.0;
    OwnedPointers<VizMesh> m_meshes;
    OwnedPointers<VizMesh> m_cgMeshes;
    OwnedPointers<VizWire> m_wires;
    OwnedPointers<VizWire> m_cgWires;
    OwnedPointers<VizPointSet> m_pointSets;
    OwnedPointers<VizPointSet> m_cgPointSets;
};

} // namespace KolbaVizCore
