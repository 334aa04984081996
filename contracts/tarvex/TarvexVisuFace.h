#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygonIter.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuFace;

/// A face: vertices and a normal per vertex (x, y, z each), and the polygons that index them.
/// Arrays stay valid as long as this object or any copy of it. A default object is empty.
class TarvexVisuFace {
public:
    TarvexVisuFace() = default;
    TarvexVisuFace(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuFace const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    bool GetID(TarvexWString& id) const;
    bool GetMechanicalID(TarvexWString& id) const;
    bool GetRGBColor(unsigned short& red, unsigned short& green, unsigned short& blue) const;
    bool GetAlphaColor(unsigned short& alpha) const;
    /// Points `vertices` at the coordinates and gives their number of floats.
    int GetVertices(float const*& vertices) const;
    /// Points `normals` at the normals and gives their number of floats.
    int GetNormals(float const*& normals) const;
    TarvexVisuPolygonIter GetPolygonIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuFace const> m_record; ///< shares the import's data
};
