#pragma once

#include <string>

namespace VizBridgeStep {

/// What can be told of a file before Open CASCADE reads it, so that a file that is not what
/// it claims fails with a clear message instead of a reader's guess.
class StepFileCheck {
public:
    StepFileCheck() = delete;

    /// Throws StepReadError unless `path` names a readable, non-empty exchange-structure file
    /// ("ISO-10303-21;" first) that ends with "END-ISO-10303-21;" and whose schema is one the
    /// reader knows (AP203, AP214 or AP242), and that gives no entity name twice. Gives the
    /// schema's name.
    static std::string Check(std::string const& path);
};

} // namespace VizBridgeStep
