#pragma once

#include "LogMessage.h"

namespace orvex::korat {

// The 1x system that the handset has found.
//
//   13   u8   version of this layout
//   42   s32  roaming indicator
//   46   s32  kind of system: 2 is 1x, with the identities that follow
//   50   u16  system identity
//   52   u16  network identity
//   131  u8   packet zone identity
//   133  u8   protocol revision
//   184  u16  base station identity
struct C2K1xSystemPacket {
    static constexpr LogCode kCode = 0x134F;

    enum class Roaming : std::int32_t { off = 0, on = 1, flashing = 2, alliancePartner = 7 };

    Roaming roaming = Roaming::off;
    int systemID = 0;
    int networkID = 0;
    int packetZoneID = 0;
    int protocolRevision = 0;
    int baseID = 0;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
