#pragma once

#include "contracts/kolba/AVizPolygonLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuPolygon.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads the triangles of one face: the index array, copied as it is (the indices stay float
/// offsets into the face's arrays), and how the indices make triangles.
///
/// Points at its source and at the attribute stack without owning either; both must outlive
/// the loader. Owns nothing: the element it loads belongs to the caller of Load.
class VizPolygonLoader : public KolbaVizCore::AVizPolygonLoader {
public:
    /// `attributes` may be null. A polygon reads neither the stack nor the flag; it takes
    /// them so that every loader of the family is made alike.
    VizPolygonLoader(TarvexVisuPolygon const& source, std::vector<TarvexVisuAttributes>* attributes,
                     bool const& inheritAttributes);
    ~VizPolygonLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    // Kept like every loader of the family, though a polygon reads neither.
    [[maybe_unused]] bool m_inheritAttributes;
    [[maybe_unused]] std::vector<TarvexVisuAttributes>* m_attributes;
    TarvexVisuPolygon const* m_source;
};

} // namespace VizBridgeTarvex
