#pragma once

#include <VizBridge/contracts/tarvex/TarvexLengthUnitType.h>

class TarvexVisuCaptureIter;
class TarvexVisuNodeIter;
class TarvexVisuViewIter;

/// The visualisation data of a document or of a reference of a product: a flat list of nodes
/// in walk order, the length unit of their coordinates, and views and captures. The closed
/// base of the library's visualisation data classes; callers hold a derived value object and
/// read it through this interface.
class TarvexVisualizationData {
public:
    virtual ~TarvexVisualizationData() = default;

    virtual TarvexVisuNodeIter GetNodeIterator() const = 0;
    virtual TarvexLengthUnitType GetUnits() const = 0;
    virtual TarvexVisuViewIter GetViewIterator() const = 0;
    virtual TarvexVisuCaptureIter GetCaptureIterator() const = 0;

protected:
    // Copied only as part of a derived value object, never sliced on its own.
    TarvexVisualizationData() = default;
    TarvexVisualizationData(TarvexVisualizationData const&) = default;
    TarvexVisualizationData& operator=(TarvexVisualizationData const&) = default;
};
