#pragma once

#include <VizBridge/contracts/kolba/AVizPolygonLoader.h>
#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>
#include <VizBridge/contracts/tarvex/TarvexVisuPolygon.h>
#include <VizBridge/loaders/VizSourceLoader.h>

#include <vector>

namespace VizBridgeTarvex {

/// Loads the triangles of one face: the index array, copied as it is (the indices stay float
/// offsets into the face's arrays), and how the indices make triangles.
class VizPolygonLoader
    : public VizSourceLoader<KolbaVizCore::AVizPolygonLoader, TarvexVisuPolygon> {
public:
    /// `attributes` may be null. A polygon reads neither the stack nor the flag; it takes
    /// them so that every loader of the family is made alike.
    VizPolygonLoader(TarvexVisuPolygon const& source, std::vector<TarvexVisuAttributes>* attributes,
                     bool const& inheritAttributes);
    ~VizPolygonLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;
};

} // namespace VizBridgeTarvex
