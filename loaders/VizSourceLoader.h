#pragma once

#include <VizBridge/contracts/tarvex/TarvexVisuAttributes.h>

#include <vector>

namespace VizBridgeTarvex {

/// What the loaders of the family share behind the scene library's loader base `Base`: the
/// object they read, the attribute stack of the node walk, and the flag that says whether a
/// missing colour is looked up in that stack (each loader says what it does with it).
///
/// Points at the source and at the stack without owning either; both must outlive the
/// loader, which is made for one Load. Owns nothing: the element it loads belongs to the
/// caller of Load.
template <class Base, class Source> class VizSourceLoader : public Base {
protected:
    /// `attributes` may be null.
    VizSourceLoader(Source const& source, std::vector<TarvexVisuAttributes>* attributes,
                    bool const& inheritAttributes)
        : m_inheritAttributes(inheritAttributes), m_attributes(attributes), m_source(&source) {}

    bool m_inheritAttributes;
    std::vector<TarvexVisuAttributes>* m_attributes; ///< not owned, may be null
    Source const* m_source;                          ///< not owned
};

} // namespace VizBridgeTarvex
