#pragma once

#include <VizBridge/contracts/tarvex/TarvexAuthoredVisuGeometry.h>
#include <VizBridge/contracts/tarvex/TarvexVisuIterator.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygon.h>

/// The polygons of a face.
class TarvexVisuPolygonIter : public TarvexVisuIterator<TarvexVisuPolygonIter, TarvexVisuPolygon,
                                                        TarvexAuthoredVisuPolygon> {
public:
    using TarvexVisuIterator::TarvexVisuIterator;

    static constexpr char const* kGetCount = "TarvexVisuPolygonIter::GetCount";
    static constexpr char const* kNext = "TarvexVisuPolygonIter::Next";
    static constexpr char const* kCurrent = "TarvexVisuPolygonIter::Current";
};
