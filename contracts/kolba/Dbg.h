#pragma once

#include <ostream>

namespace KolbaVizCore {

/// The library's diagnostic stream. It discards everything until a host gives it a buffer
/// with `dbg.rdbuf(buffer)`; `ResetDbg()` makes it silent again.
extern std::ostream dbg;

void ResetDbg();

} // namespace KolbaVizCore
