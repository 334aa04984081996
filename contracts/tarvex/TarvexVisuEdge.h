#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuLineType.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuEdge;

/// A polyline: a float array of points (x, y, z each) and the indices that pick from it, each
/// the offset of a point's first coordinate. Arrays stay valid as long as this object or any
/// copy of it. A default object has no points and no index array.
class TarvexVisuEdge {
public:
    TarvexVisuEdge() = default;
    TarvexVisuEdge(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuEdge const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    bool GetMechanicalID(TarvexWString& id) const;
    /// Points `points` at the coordinates and gives their number of floats.
    int GetPoints(float const*& points) const;
    /// Points `indices` at the index array, null if the edge has none, sets the line type,
    /// and gives the number of indices.
    int GetLineIndices(int const*& indices, TarvexVisuLineType& type) const;
    bool GetRGBColor(unsigned short& red, unsigned short& green, unsigned short& blue) const;
    bool GetAlphaColor(unsigned short& alpha) const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuEdge const> m_record; ///< shares the import's data
};
