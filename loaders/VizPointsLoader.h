#pragma once

#include "contracts/kolba/AVizPointsLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuPoints.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads one group of loose points: its own colour and its points resolved from the index
/// array into a flat vertex list. Gives null for a group without indices.
///
/// Points at its source and at the attribute stack without owning either; both must outlive
/// the loader. Owns nothing: the element it loads belongs to the caller of Load.
class VizPointsLoader : public KolbaVizCore::AVizPointsLoader {
public:
    /// `attributes` may be null. With `inheritAttributes`, a colour or alpha the points lack
    /// is taken from the stack.
    VizPointsLoader(TarvexVisuPoints const& source, std::vector<TarvexVisuAttributes>* attributes,
                    bool const& inheritAttributes);
    ~VizPointsLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes;
    TarvexVisuPoints const* m_source;
};

} // namespace VizBridgeTarvex
