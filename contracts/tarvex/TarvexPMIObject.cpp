#include <VizBridge/contracts/tarvex/TarvexPMIObject.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>

TarvexWString TarvexPMIObject::GetName() const {
    auto const* record = read<TarvexAuthoredPMIObject>("TarvexPMIObject::GetName");
    return record ? TarvexWString(record->name) : TarvexWString();
}

TarvexWString TarvexPMIObject::GetID() const {
    auto const* record = read<TarvexAuthoredPMIObject>("TarvexPMIObject::GetID");
    return record ? TarvexWString(record->id) : TarvexWString();
}

bool TarvexPMIObject::IsHidden() const {
    auto const* record = read<TarvexAuthoredPMIObject>("TarvexPMIObject::IsHidden");
    return record && record->hidden;
}
