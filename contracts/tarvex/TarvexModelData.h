#pragma once

#include <VizBridge/contracts/platform/WString.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredDocument.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredInstance.h>
#include <VizBridge/contracts/tarvex/TarvexAuthoredReference.h>
#include <VizBridge/contracts/tarvex/TarvexFaultPlan.h>
#include <VizBridge/contracts/tarvex/TarvexFontCache.h>
#include <VizBridge/contracts/tarvex/TarvexImportLog.h>
#include <VizBridge/contracts/tarvex/TarvexLengthUnitType.h>
#include <VizBridge/contracts/tarvex/TarvexPartConversion.h>

#include <deque>
#include <map>
#include <optional>
#include <vector>

/// The data of one TarvexModel, shared by the model and every value object it handed out;
/// the last of them to go frees it. Internal to the library: hosts and tests author through
/// TarvexModel and read through the value objects. Owns everything it holds.
class TarvexModelData {
public:
    std::optional<VizPort::WString> productName;
    TarvexLengthUnitType unit = TarvexLengthUnit_Unknown;
    /// Replaces the computed unique-reference count when set.
    std::optional<int> uniqueReferencesCount;
    /// By unique id. Map nodes never move, so the records handed out by the authoring API
    /// stay valid while references are added.
    std::map<unsigned int, TarvexAuthoredReference> references;
    /// Instance with authoring id n at position n - 1. A deque keeps the records handed out
    /// by the authoring API valid while instances are appended.
    std::deque<TarvexAuthoredInstance> instances;
    /// Authoring ids of the root instances, in the order they were added.
    std::vector<unsigned int> rootInstances;
    TarvexAuthoredDocument document;
    std::vector<std::optional<VizPort::WString>> missingFiles;
    TarvexFaultPlan faults;
    /// Reference ids that the spooler delivers first, in this order.
    std::vector<unsigned int> spoolerDeliveryOrder;
    /// Delivered id by reference id: the spooler hands the reference over under another id.
    std::map<unsigned int, unsigned int> spoolerIdAliases;
    /// The parts converted so far. Mutable: value objects hold the data as const, and a
    /// conversion on first use changes no authored value. Thread-safe on its own.
    mutable TarvexPartConversion conversions;
    /// The fonts the text builder opened for this model's texts. Mutable for the same reason
    /// as the conversions; thread-safe on its own.
    mutable TarvexFontCache fonts;
    /// The importer calls made on this model. Thread-safe on its own.
    mutable TarvexImportLog importLog;

    /// Null when the model does not know `uniqueId`.
    TarvexAuthoredReference const* FindReference(unsigned int uniqueId) const;
    /// Null when the model does not know `instanceId`.
    TarvexAuthoredInstance const* FindInstance(unsigned int instanceId) const;
    /// The defined references reachable from the root instances, each counted once.
    int CountReachableReferences() const;
    /// The reference that the spooler delivers as `deliveredId`: the one aliased to it if
    /// any (the smallest reference id when several are), otherwise `deliveredId` itself.
    unsigned int ResolveDeliveredId(unsigned int deliveredId) const;
};
