#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygonType.h>

#include <memory>

struct TarvexAuthoredVisuPolygon;

/// Triangles of a face, as offsets into the face's vertex and normal arrays. A default
/// object has no index array.
class TarvexVisuPolygon {
public:
    TarvexVisuPolygon() = default;
    TarvexVisuPolygon(TarvexVisuContext context,
                      std::shared_ptr<TarvexAuthoredVisuPolygon const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    /// Points `indices` at the index array, null if there is none, sets the polygon type, and
    /// gives the number of indices.
    int GetPolygonIndices(int const*& indices, TarvexVisuPolygonType& type) const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuPolygon const> m_record; ///< shares the import's data
};
