#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>
#include <VizBridge/contracts/tarvex/TarvexVisuEdgeIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuFaceIter.h>
#include <VizBridge/contracts/tarvex/TarvexVisuGeometryType.h>
#include <VizBridge/contracts/tarvex/TarvexWString.h>

#include <memory>

struct TarvexAuthoredVisuMesh;

/// A tessellated body: its faces and its edges. A default object is an empty mesh of
/// unknown geometry type.
class TarvexVisuMesh {
public:
    TarvexVisuMesh() = default;
    TarvexVisuMesh(TarvexVisuContext context, std::shared_ptr<TarvexAuthoredVisuMesh const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    bool GetID(TarvexWString& id) const;
    bool GetMechanicalID(TarvexWString& id) const;
    TarvexVisuGeometryType GetGeometryType() const;
    TarvexVisuFaceIter GetFaceIterator() const;
    TarvexVisuEdgeIter GetEdgeIterator() const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredVisuMesh const> m_record; ///< shares the import's data
};
