#pragma once

namespace VizPort {

/// Gives up the processor for about `milliseconds` ms, as the Windows Sleep does.
void Sleep(unsigned long milliseconds);

} // namespace VizPort
