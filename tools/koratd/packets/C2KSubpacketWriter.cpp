#include "C2KSubpacketWriter.h"

#include <numeric>

namespace orvex::korat {

namespace {
constexpr std::size_t kFirstSubpacket = 17;
}

C2KSubpacketWriter::C2KSubpacketWriter(
    LogCode code, Microseconds time, const std::vector<std::size_t>& lengths)
    : _packet(code, time, std::accumulate(lengths.begin(), lengths.end(), kFirstSubpacket))
    , _lengths(lengths)
    , _start(kFirstSubpacket)
{
    _packet.u8(14, static_cast<std::int64_t>(lengths.size()));
}

void C2KSubpacketWriter::start(int identity)
{
    if (_next > 0)
        _start += _lengths.at(_next - 1);
    u8(0, identity);
    u16(2, static_cast<std::int64_t>(_lengths.at(_next)));
    ++_next;
}

} // namespace orvex::korat
