#pragma once

#include "contracts/kolba/AVizPointSetLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuPointSet.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads a point set: its groups of points, which always inherit colour and alpha from the
/// attribute stack. A point set has no id of its own.
///
/// Points at its source and at the attribute stack without owning either; both must outlive
/// the loader. Owns nothing: the element it loads belongs to the caller of Load.
class VizPointSetLoader : public KolbaVizCore::AVizPointSetLoader {
public:
    /// `attributes` may be null. The flag changes nothing: a set's points always inherit.
    VizPointSetLoader(TarvexVisuPointSet const& source,
                      std::vector<TarvexVisuAttributes>* attributes, bool const& inheritAttributes);
    ~VizPointSetLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    // Kept like every loader of the family, though this one does not read it.
    [[maybe_unused]] bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes;
    TarvexVisuPointSet const* m_source;
};

} // namespace VizBridgeTarvex
