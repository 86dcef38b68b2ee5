#include "C2K/SubpacketWalk.h"

#include "SystemLog.h"

namespace orvex {

namespace {
constexpr std::size_t kCount = 14;
constexpr std::size_t kFirst = 17;
constexpr std::size_t kHeaderLength = 4;
} // namespace

std::optional<Subpacket> SubpacketWalk::find(int id) const
{
    const int count = _packet.u8(kCount);
    std::size_t start = kFirst;
    for (int index = 0; index < count; ++index) { // also ends a walk over sizes of zero
        if (!_packet.contains(start, kHeaderLength))
            return std::nullopt;
        const int size = _packet.u16(start + 2);
        const std::size_t end = start + static_cast<std::size_t>(size);
        // Deliberately lenient by the bytes before the first subpacket: a subpacket may claim up to 16
        // bytes beyond the packet and is still found.
        if (end >= kFirst + _packet.size()) {
            systemLog(Priority::error, "Log code error in subpkt#%d: bad size (%d).", index, size);
            return std::nullopt;
        }
        if (_packet.u8(start) == id)
            return Subpacket(_packet.from(start));
        start = end;
    }
    return std::nullopt;
}

} // namespace orvex
