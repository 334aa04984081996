#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <memory>

struct TarvexAuthoredVisuPoints;

/// Loose points: a float array (x, y, z each) and the indices that pick from it, each the
/// offset of a point's first coordinate. A default object has no points and no index array.
class TarvexVisuPoints {
public:
    TarvexVisuPoints() = default;
    TarvexVisuPoints(TarvexVisuContext context,
                     std::shared_ptr<TarvexAuthoredVisuPoints const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    /// Points `points` at the coordinates and gives their number of floats.
    int GetPoints(float const*& points) const;
    /// Points `indices` at the index array, null if there is none, and gives its length.
    int GetPointIndices(int const*& indices) const;
    bool GetRGBColor(unsigned short& red, unsigned short& green, unsigned short& blue) const;
    bool GetAlphaColor(unsigned short& alpha) const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuPoints const> m_record; ///< shares the import's data
};
