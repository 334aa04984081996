#pragma once

#include <VizBridge/contracts/kolba/EntityId.h>
#include <VizBridge/contracts/platform/WString.h>

#include <map>
#include <vector>

namespace KolbaVizCore {

/// The semantic record of one PMI object: names, its key/value text and the entities
/// it is linked to. A plain value.
struct SemanticPMI {
    VizPort::WString Name;
    VizPort::WString Label;
    VizPort::WString ID;
    std::map<VizPort::WString, VizPort::WString> Properties;
    std::vector<EntityId> BREPLinks;

    /// "Name : …", "Label : …", "ID : …", then one "key : value" line per property in key
    /// order, each line ending in a line feed.
    VizPort::WString ToString() const;
};

} // namespace KolbaVizCore
