#include <VizBridge/contracts/tarvex/TarvexModelData.h>

#include <set>

TarvexAuthoredReference const* TarvexModelData::FindReference(unsigned int uniqueId) const {
    auto const found = references.find(uniqueId);
    return found == references.end() ? nullptr : &found->second;
}

TarvexAuthoredInstance const* TarvexModelData::FindInstance(unsigned int instanceId) const {
    if (instanceId == 0 || instanceId > instances.size()) {
        return nullptr;
    }
    return &instances[instanceId - 1];
}

int TarvexModelData::CountReachableReferences() const {
    // A reference that is placed but never defined reads back as an empty sub-assembly and
    // gets nothing loaded, so it is not counted. The visited set also ends the walk when an
    // authored structure places an assembly inside itself.
    std::set<unsigned int> visited;
    std::vector<unsigned int> pending(rootInstances.rbegin(), rootInstances.rend());
    while (!pending.empty()) {
        unsigned int const instanceId = pending.back();
        pending.pop_back();
        TarvexAuthoredInstance const* const instance = FindInstance(instanceId);
        if (instance == nullptr) {
            continue;
        }
        TarvexAuthoredReference const* const reference = FindReference(instance->referenceId);
        if (reference == nullptr || !visited.insert(reference->uniqueId).second) {
            continue;
        }
        pending.insert(pending.end(), reference->instances.rbegin(), reference->instances.rend());
    }
    return static_cast<int>(visited.size());
}

unsigned int TarvexModelData::ResolveDeliveredId(unsigned int deliveredId) const {
    for (auto const& [referenceId, aliasId] : spoolerIdAliases) {
        if (aliasId == deliveredId) {
            return referenceId;
        }
    }
    return deliveredId;
}
