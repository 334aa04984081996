#pragma once

#include "contracts/kolba/AVizViewLoader.h"
#include "contracts/tarvex/TarvexVisuAttributes.h"
#include "contracts/tarvex/TarvexVisuView.h"

#include <vector>

namespace VizBridgeTarvex {

/// Loads one view: its hidden state, name, visual and mechanical ids, its plane, and the ids
/// of the annotations it groups as member keys.
///
/// Points at its source without owning it; the source must outlive the loader. The attribute
/// stack and the flag are kept like every loader's, but a view reads neither. Owns nothing:
/// the element it loads belongs to the caller of Load.
class VizViewLoader : public KolbaVizCore::AVizViewLoader {
public:
    VizViewLoader(TarvexVisuView const& source, std::vector<TarvexVisuAttributes>* attributes,
                  bool const& inheritAttributes);
    ~VizViewLoader() override = default;

protected:
    KolbaVizCore::VizElement* loadOne() override;

private:
    bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes; ///< not owned, may be null, not read
    TarvexVisuView const* m_source;                  ///< not owned
};

} // namespace VizBridgeTarvex
