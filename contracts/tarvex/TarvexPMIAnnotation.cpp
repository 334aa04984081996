#include <VizBridge/contracts/tarvex/TarvexPMIAnnotation.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMILeaderIter.h>

TarvexPMIAnnotation::TarvexPMIAnnotation(TarvexVisuContext context,
                                         std::shared_ptr<TarvexAuthoredPMIAnnotation const> record)
    : TarvexPMIObject(std::move(context), std::move(record)) {}

TarvexPMIAnnotationType TarvexPMIAnnotation::GetObjectType() const {
    auto const* record = read<TarvexAuthoredPMIAnnotation>("TarvexPMIAnnotation::GetObjectType");
    if (!record ||
        (record->objectType >= TarvexPMI_Datum && record->objectType <= TarvexPMI_Dimension)) {
        return TarvexPMI_UnknownType;
    }
    return record->objectType;
}

bool TarvexPMIAnnotation::GetPositioning(float* const position, TarvexPMIOrientation& orientation,
                                         float& angle, float& zDepth) const {
    auto const* record = read<TarvexAuthoredPMIAnnotation>("TarvexPMIAnnotation::GetPositioning");
    if (!record || !record->positioning || !position) {
        return false;
    }
    auto const& placed = *record->positioning;
    position[0] = placed.position[0];
    position[1] = placed.position[1];
    orientation = placed.orientation;
    angle = placed.angle;
    zDepth = placed.zDepth;
    return true;
}

TarvexPMILeaderIter TarvexPMIAnnotation::GetLeaderIterator() const {
    auto const* record =
        read<TarvexAuthoredPMIAnnotation>("TarvexPMIAnnotation::GetLeaderIterator");
    if (!record) {
        return TarvexPMILeaderIter();
    }
    return TarvexPMILeaderIter(context(), share(record->leaders));
}

int TarvexPMIAnnotation::GetLinkedElementsCount() const {
    auto const* record =
        read<TarvexAuthoredPMIAnnotation>("TarvexPMIAnnotation::GetLinkedElementsCount");
    return record ? static_cast<int>(record->linkedElements.size()) : 0;
}

void TarvexPMIAnnotation::GetLinkedElement(int index, TarvexEntity& entity) const {
    auto const* record = read<TarvexAuthoredPMIAnnotation>("TarvexPMIAnnotation::GetLinkedElement");
    if (!record || index < 0 || index >= static_cast<int>(record->linkedElements.size())) {
        return;
    }
    entity =
        TarvexEntity(context().Model(), record->linkedElements[static_cast<std::size_t>(index)]);
}
