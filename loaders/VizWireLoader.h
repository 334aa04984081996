#pragma once

#include "contracts/kolba/AVizWireLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuWire.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads a wire: its visual id and its edges. The edges always inherit colour and alpha from
/// the attribute stack; the wire's own colour is set by whoever places it in the scene.
///
/// Points at its source and at the attribute stack without owning either; both must outlive
/// the loader. Owns nothing: the element it loads belongs to the caller of Load.
class VizWireLoader : public KolbaVizCore::AVizWireLoader {
public:
    /// `attributes` may be null. The flag changes nothing: a wire's edges always inherit.
    VizWireLoader(TarvexVisuWire const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizWireLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    // Kept like every loader of the family, though this one does not read it.
    [[maybe_unused]] bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes;
    TarvexVisuWire const* m_source;
};

} // namespace VizBridgeTarvex
