#pragma once

#include <cstdint>

namespace VizBridgeBench {

/// Bytes requested from the global operator new and not yet given back, process-wide. A
/// benchmark that links the `vizbridge_live_bytes` object library gets the replaced operators
/// that keep this count; the allocator's own overhead is not counted.
std::int64_t LiveBytes();

} // namespace VizBridgeBench
