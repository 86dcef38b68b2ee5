#pragma once

#include "PacketReader.h"

namespace orvex {

// Packet system information of the cell.
//
//   13  u8  packet PSI status supported
//   14  u8  PSI messages of low repetition rate (PSI_COUNT_LR)
//   15  u8  PSI messages of high repetition rate (PSI_COUNT_HR)
//   16  u8  extended measurement order
//   33  u8  packet SI status: 0 not supported
class LogCode_0x51FD {
public:
    static constexpr LogCode kCode = 0x51FD;
    static constexpr std::size_t kMinimumLength = 35;

    explicit LogCode_0x51FD(Packet packet)
        : _packet(packet)
    {
    }

    int packetPSIStatus() const { return _packet.u8(13); }
    int countLowRepetition() const { return _packet.u8(14); }
    int countHighRepetition() const { return _packet.u8(15); }
    int extendedMeasurementOrder() const { return _packet.u8(16); }
    bool hasPacketSIStatus() const { return _packet.u8(33) != 0; }

private:
    PacketReader _packet;
};

} // namespace orvex
