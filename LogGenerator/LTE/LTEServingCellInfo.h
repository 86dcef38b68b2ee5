#pragma once

#include "CellMonitorList.h"
#include "PacketReader.h"
#include "PacketSection.h"

namespace orvex {

// LTE antennas.
//
//   20  u8  number of transmit antennas
class LogCode_0xB0C1 {
public:
    static constexpr LogCode kCode = 0xB0C1;
    static constexpr std::size_t kMinimumLength = 22;

    explicit LogCode_0xB0C1(Packet packet)
        : _packet(packet)
    {
    }

    int transmitAntennas() const { return _packet.u8(20); }

private:
    PacketReader _packet;
};

// LTE serving cell.
//
//   14  u16  physical cell identity
//   16  u16  downlink EARFCN
//   18  u16  uplink EARFCN
//   20  u8   downlink bandwidth, resource blocks
//   21  u8   uplink bandwidth, resource blocks
//   22  s32  cell identity
//   26  u16  tracking area code
//   28  s32  frequency band indicator
//   32  6    not read
class LogCode_0xB0C2 {
public:
    static constexpr LogCode kCode = 0xB0C2;
    static constexpr std::size_t kMinimumLength = 38;

    explicit LogCode_0xB0C2(Packet packet)
        : _packet(packet)
    {
    }

    int physicalCellIdentity() const { return _packet.u16(14); }
    int downlinkFrequency() const { return _packet.u16(16); }
    int uplinkFrequency() const { return _packet.u16(18); }
    int downlinkBandwidth() const { return _packet.u8(20); }
    int uplinkBandwidth() const { return _packet.u8(21); }
    std::int32_t cellIdentity() const { return _packet.s32(22); }
    int trackingAreaCode() const { return _packet.u16(26); }
    std::int32_t frequencyBandIndicator() const { return _packet.s32(28); }

private:
    PacketReader _packet;
};

// "Serving Cell Info": identity of the serving LTE cell, from the baseband and from the telephony service's
// cell-monitor list. A row that both have shows whichever came last.
class LTEServingCellInfo final : public PacketSection<LogCode_0xB0C2, LogCode_0xB0C1, CellMonitorList> {
public:
    LTEServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xB0C2& cell) override;
    void update(const LogCode_0xB0C1& antennas) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
