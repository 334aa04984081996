#pragma once

#include <VizBridge/model/VizTypes.h>

#include <map>
#include <memory>
#include <vector>

namespace VizBridgeTarvex {

class VizPartContainer;

/// The containers of a product structure by reference id, and the containers themselves.
/// A structure and its copies share one store, so that a container added to or removed from
/// one of them is added to or removed from all, and the last of them frees the containers:
/// the tessellated ones first, then the PMI containers, then the part containers.
///
/// Owns every container handed to an Add until a Remove gives it back. A container that an
/// Add replaces under its id stays owned here until the store goes, so that pointers to it
/// and to its elements that were handed out stay valid.
class VizContainerStore {
public:
    VizContainerStore() = default;
    VizContainerStore(VizContainerStore const&) = delete;
    VizContainerStore& operator=(VizContainerStore const&) = delete;
    ~VizContainerStore();

    std::map<int, VizPartContainer*> const& Parts() const { return m_parts; }
    std::map<int, VizContainer*> const& Geometry() const { return m_geometry; }
    std::map<int, VizPMIContainer*> const& PMI() const { return m_pmi; }

    /// Takes ownership and sets the value under `id`, overwriting what stood there; a null
    /// container is stored as a null value.
    void AddPart(int id, std::unique_ptr<VizPartContainer> container);
    void AddGeometry(int id, std::unique_ptr<VizContainer> container);
    void AddPMI(int id, std::unique_ptr<VizPMIContainer> container);

    /// Erases the first pair, in key order, that holds `container`, and hands the container
    /// back; null, and nothing changed, when no pair holds it.
    std::unique_ptr<VizPartContainer> RemovePart(VizPartContainer const* container);
    std::unique_ptr<VizPMIContainer> RemovePMI(VizPMIContainer const* container);

private:
    std::map<int, VizPartContainer*> m_parts; ///< owned through m_ownedParts
    std::map<int, VizContainer*> m_geometry;  ///< owned through m_ownedGeometry
    std::map<int, VizPMIContainer*> m_pmi;    ///< owned through m_ownedPMI
    std::vector<std::unique_ptr<VizPartContainer>> m_ownedParts;
    std::vector<std::unique_ptr<VizContainer>> m_ownedGeometry;
    std::vector<std::unique_ptr<VizPMIContainer>> m_ownedPMI;
};

} // namespace VizBridgeTarvex
