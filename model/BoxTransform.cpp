#include <VizBridge/model/BoxTransform.h>

namespace VizBridgeTarvex {

VizBox TransformBox(VizTransf const& transformation, VizBox const& box) {
    if (box.IsEmpty())
        return box;
    VizBox moved;
    double const* const low = box.GetLow();
    double const* const high = box.GetHigh();
    for (int corner = 0; corner < 8; ++corner) {
        double const point[3] = {(corner & 1) ? high[0] : low[0], (corner & 2) ? high[1] : low[1],
                                 (corner & 4) ? high[2] : low[2]};
        double mapped[3];
        transformation.Apply(point, mapped);
        moved.Add(mapped);
    }
    return moved;
}

} // namespace VizBridgeTarvex
