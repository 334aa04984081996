#pragma once

#include <VizBridge/model/VizTypes.h>

namespace VizBridgeTarvex {

/// Two paths are the same when they have the same length, the same leading word and the
/// same tags.
inline bool SameRenderId(RenderId const& a, RenderId const& b) {
    if (a.Length() != b.Length() || a.GetLeading() != b.GetLeading())
        return false;
    for (int i = 0; i < a.Length(); ++i) {
        if (a[i] != b[i])
            return false;
    }
    return true;
}

} // namespace VizBridgeTarvex
