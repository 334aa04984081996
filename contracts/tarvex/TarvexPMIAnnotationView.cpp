#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationView.h>

#include <VizBridge/contracts/tarvex/TarvexAuthoredPMI.h>
#include <VizBridge/contracts/tarvex/TarvexPMIAnnotationIter.h>

#include <algorithm>

TarvexPMIAnnotationView::TarvexPMIAnnotationView(
    TarvexVisuContext context, std::shared_ptr<TarvexAuthoredPMIAnnotationView const> record)
    : TarvexPMIObject(std::move(context), std::move(record)) {}

bool TarvexPMIAnnotationView::GetAxis(float* const origin, float* const uDirection,
                                      float* const vDirection) const {
    auto const* record = read<TarvexAuthoredPMIAnnotationView>("TarvexPMIAnnotationView::GetAxis");
    if (!record || !record->axis || !origin || !uDirection || !vDirection) {
        return false;
    }
    std::copy(record->axis->origin.begin(), record->axis->origin.end(), origin);
    std::copy(record->axis->uDirection.begin(), record->axis->uDirection.end(), uDirection);
    std::copy(record->axis->vDirection.begin(), record->axis->vDirection.end(), vDirection);
    return true;
}

TarvexPMIAnnotationIter TarvexPMIAnnotationView::GetAnnotationIterator() const {
    auto const* record =
        read<TarvexAuthoredPMIAnnotationView>("TarvexPMIAnnotationView::GetAnnotationIterator");
    return record ? TarvexPMIAnnotationIter(context(), share(record->annotations))
                  : TarvexPMIAnnotationIter();
}
