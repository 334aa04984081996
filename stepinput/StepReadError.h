#pragma once

#include <stdexcept>

namespace VizBridgeStep {

/// A STEP file that cannot be read: missing, unreadable, empty, truncated, no STEP file, a
/// schema the reader does not know, records without a name or with one name twice, broken
/// geometry, or no shape in it. what() is one line that names the
/// file and says what is wrong with it.
class StepReadError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

} // namespace VizBridgeStep
