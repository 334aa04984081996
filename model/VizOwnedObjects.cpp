#include "model/VizOwnedObjects.h"

#include "model/VizPSEntry.h"
#include "model/VizPartContainer.h"

namespace VizBridgeTarvex {

namespace {
template <typename T> void deleteAll(std::unordered_set<T*>& objects) {
    for (T* object : objects)
        delete object; // owned since it was handed to the structure
    objects.clear();
}
} // namespace

VizOwnedObjects::~VizOwnedObjects() {
    // Containers go before entries.
    deleteAll(m_vizContainers);
    deleteAll(m_pmiContainers);
    deleteAll(m_partContainers);
    m_entries.clear();
}

} // namespace VizBridgeTarvex
