#pragma once

#include "contracts/kolba/AVizCaptureLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuCapture.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads one capture: its hidden and active states, its camera, name, ids, hidden text and
/// clipping plane, and as member keys the ids of its annotations, then those of its FTA
/// constructed geometry, then, if it manages geometry, the paths of the bodies it shows: the names
/// of the instances above a body, outermost first, each followed by "<KolbaSlash>" when there are
/// two or more, and then the visual id of the part entity it ends in.
///
/// Points at its source without owning it; the source must outlive the loader. The attribute
/// stack and the flag are kept like every loader's, but a capture reads neither. Owns
/// nothing: the element it loads belongs to the caller of Load.
class VizCaptureLoader : public KolbaVizCore::AVizCaptureLoader {
public:
    VizCaptureLoader(TarvexVisuCapture const& source, std::vector<TarvexVisuAttributes>* attributes,
                     bool const& inheritAttributes);
    ~VizCaptureLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes; ///< not owned, may be null, not read
    TarvexVisuCapture const* m_source;               ///< not owned
};

} // namespace VizBridgeTarvex
