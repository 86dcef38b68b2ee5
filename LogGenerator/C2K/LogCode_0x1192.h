#pragma once

#include "PacketReader.h"

namespace orvex {

// EV-DO forward link: packets received so far, by format.
//
//   13    u32  sequence number
//   17+4i u32  packets of format i, of 56
class LogCode_0x1192 {
public:
    static constexpr LogCode kCode = 0x1192;
    static constexpr std::size_t kMinimumLength = 241;
    static constexpr std::size_t kFormats = 56;

    explicit LogCode_0x1192(Packet packet)
        : _packet(packet)
    {
    }

    std::int32_t sequence() const { return _packet.s32(13); }
    std::uint32_t packets(std::size_t format) const { return _packet.u32(17 + 4 * format); }

private:
    PacketReader _packet;
};

} // namespace orvex
