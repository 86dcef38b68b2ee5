#pragma once

#include "PacketReader.h"

namespace orvex {

// GSM measurement report.
//
//   19  u8  not 0: discontinuous transmission in use
class LogCode_0x5072 {
public:
    static constexpr LogCode kCode = 0x5072;
    static constexpr std::size_t kMinimumLength = 20;

    explicit LogCode_0x5072(Packet packet)
        : _packet(packet)
    {
    }

    bool isDTXUsed() const { return _packet.u8(19) != 0; }

private:
    PacketReader _packet;
};

} // namespace orvex
