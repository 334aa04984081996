#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuContext.h>

#include <memory>

struct TarvexAuthoredPMILeader;

/// A leader line of an annotation: its points in the annotation's plane. A default leader has
/// no points.
class TarvexPMILeader {
public:
    TarvexPMILeader() = default;
    TarvexPMILeader(TarvexVisuContext context,
                    std::shared_ptr<TarvexAuthoredPMILeader const> record)
        : m_context(std::move(context)), m_record(std::move(record)) {}

    int GetPointCount() const;
    /// The first and second coordinate of point `index` (from 0); left alone out of range.
    void GetPoint(int index, float& first, float& second) const;

private:
    TarvexVisuContext m_context;
    std::shared_ptr<TarvexAuthoredPMILeader const> m_record; ///< shares its annotation's record
};
