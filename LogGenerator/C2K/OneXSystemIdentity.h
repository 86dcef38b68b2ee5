#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"

#include <optional>

namespace orvex {

// 1x system identity.
//
//   13   u8   version, 2 or higher
//   42   s32  roaming indicator
//   46   s32  system type; 2 for CDMA, whose identity follows
//   50   u16  system identity
//   52   u16  network identity
//   131  u8   packet zone identity
//   133  u8   protocol revision
//   184  u16  base station identity, not in the shorter packets
class LogCode_0x134F {
public:
    static constexpr LogCode kCode = 0x134F;
    static constexpr std::size_t kMinimumLength = 171;
    static constexpr int kLowestVersion = 2;
    static constexpr int kSystemTypeCDMA = 2;

    explicit LogCode_0x134F(Packet packet)
        : _packet(packet)
    {
    }

    int version() const { return _packet.u8(13); }
    int roamingIndicator() const { return _packet.s32(42); }
    int systemType() const { return _packet.s32(46); }
    int systemIdentity() const { return _packet.u16(50); }
    int networkIdentity() const { return _packet.u16(52); }
    int packetZoneIdentity() const { return _packet.u8(131); }
    int protocolRevision() const { return _packet.u8(133); }
    std::optional<int> baseIdentity() const
    {
        return _packet.contains(184, 2) ? std::optional<int>(_packet.u16(184)) : std::nullopt;
    }

private:
    PacketReader _packet;
};

// 1x system identity: the network's identity and whether the handset is roaming.
class OneXSystemIdentity {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
