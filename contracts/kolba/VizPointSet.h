#pragma once

#include <VizBridge/contracts/kolba/OwnedPointers.h>
#include <VizBridge/contracts/kolba/VizElement.h>
#include <VizBridge/contracts/kolba/VizPoints.h>

#include <string>
#include <vector>

namespace KolbaVizCore {

/// A cloud body: groups of points. Owns its groups.
class VizPointSet : public VizElement {
public:
    VizPointSet() = default;
    VizPointSet(VizPointSet const&) = delete;
    VizPointSet& operator=(VizPointSet const&) = delete;

    static std::string TypeID() { return "VizPointSet"; }
    std::string const GetElementType() const override { return TypeID(); }

    void SetPointsCountHint(unsigned int count) { m_points.Reserve(count); }
    /// Takes over `points`; null is ignored.
    void AddPoints(VizPoints* points) { m_points.Add(points); }
    std::vector<VizPoints*> const& GetPointSets() const { return m_points.Get(); }

private:
    OwnedPointers<VizPoints> m_points;
};

} // namespace KolbaVizCore
