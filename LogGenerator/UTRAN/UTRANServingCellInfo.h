#pragma once

#include "Base.h"
#include "CellMonitorList.h"
#include "PacketReader.h"
#include "PacketSection.h"

namespace orvex {

// UTRAN RRC state.
//
//   13  u8  1 when the state is valid
//   14  u8  RRC state
class LogCode_0xD0E0 {
public:
    static constexpr LogCode kCode = 0xD0E0;
    static constexpr std::size_t kExpectedLength = 15;
    static constexpr int kInvalidState = 255;

    explicit LogCode_0xD0E0(Packet packet)
        : _packet(packet)
    {
    }

    // kInvalidState unless the packet holds a state and says that it is valid.
    int state() const
    {
        return _packet.u8(13) == 1 && _packet.contains(14, 1) ? _packet.u8(14) : kInvalidState;
    }

private:
    PacketReader _packet;
};

// "RRC Info": the UTRAN RRC state (3GPP TS 25.331, clause 7.1).
class RRC_State final : public Base {
public:
    RRC_State(ClassDictionary& dict, CodeDictionary& codeDict);

    void updateWithData(Packet packet, LogCode logCode) override;
};

// UTRAN serving cell.
//
//   14  u8   cell access restrictions
//   15  u8   URA identity
//   17  u16  uplink UARFCN
//   19  u16  downlink UARFCN
//   21  s32  cell identity
//   25  u8   bit 0: access class barring, emergency calls only
class LogCode_0xD0E2 {
public:
    static constexpr LogCode kCode = 0xD0E2;
    static constexpr std::size_t kMinimumLength = 26;

    explicit LogCode_0xD0E2(Packet packet)
        : _packet(packet)
    {
    }

    int cellAccessRestrictions() const { return _packet.u8(14); }
    int uraIdentity() const { return _packet.u8(15); }
    int uplinkUARFCN() const { return _packet.u16(17); }
    int downlinkUARFCN() const { return _packet.u16(19); }
    std::int32_t cellIdentity() const { return _packet.s32(21); }
    bool isBarred() const { return _packet.bits(25, 0, 1) == 1; }

private:
    PacketReader _packet;
};

// "Serving Cell Info": identity of the serving UTRAN cell, from the baseband and from the telephony
// service's cell-monitor list. A row that both have shows whichever came last.
class UTRANServingCellInfo final : public PacketSection<LogCode_0xD0E2, CellMonitorList> {
public:
    UTRANServingCellInfo(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0xD0E2& cell) override;
    void update(const CellMonitorList& list) override;
};

} // namespace orvex
