#include <VizBridge/contracts/kolba/Dbg.h>

#include <streambuf>

namespace KolbaVizCore {

namespace {

/// Accepts every character and keeps none: the stream stays good and says nothing.
class DiscardingBuffer : public std::streambuf {
protected:
    int_type overflow(int_type c) override { return traits_type::not_eof(c); }
    std::streamsize xsputn(char_type const*, std::streamsize count) override { return count; }
};

// Defined before the stream, so that it is constructed first.
DiscardingBuffer discardingBuffer;

} // namespace

std::ostream dbg(&discardingBuffer);

void ResetDbg() {
    // rdbuf also clears a bad state that a missing host buffer may have left.
    dbg.rdbuf(&discardingBuffer);
}

} // namespace KolbaVizCore
