#pragma once

#include "CellMonitorList.h"
#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

#include <map>

namespace orvex {

// GSM cell information.
//
//   13  u16  ARFCN
//   15  u16  BSIC
//   17  u16  cell identity
class LogCode_0x5134 {
public:
    static constexpr LogCode kCode = 0x5134;
    static constexpr std::size_t kMinimumLength = 26;

    explicit LogCode_0x5134(Packet packet)
        : _packet(packet)
    {
    }

    int arfcn() const { return _packet.u16(13); }
    int bsic() const { return _packet.u16(15); }
    int cellIdentity() const { return _packet.u16(17); }

private:
    PacketReader _packet;
};

// GSM surround cells, as seen from the serving one. Four sections read it. Bytes 16 to 23 are C1 and C2 to
// one of them and the receive qualities to another.
//
//   15      u8   serving receive level
//   16      u32  C1 in the low 16 bits; receive quality, full
//   20      u32  C2 in the low 16 bits; receive quality, sub
//   26      u8   not 0: cell reselection hysteresis applies
//   28      u8   number of neighbours
//   29+14i       neighbour i
class LogCode_0x5137 {
public:
    static constexpr LogCode kCode = 0x5137;
    static constexpr std::size_t kMinimumLength = 29;

    //   0   u16  ARFCN
    //   2   u8   receive level
    //   3   s32  C1
    //   7   ...  not read
    class Neighbor {
    public:
        explicit Neighbor(PacketReader record)
            : _record(record)
        {
        }

        int arfcn() const { return _record.u16(0); }
        int receiveLevel() const { return _record.u8(2); }
        std::int32_t c1() const { return _record.s32(3); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x5137(Packet packet)
        : _packet(packet)
    {
    }

    int receiveLevel() const { return _packet.u8(15); }
    int c1() const { return _packet.u16(16); }
    int c2() const { return _packet.u16(20); }
    std::int32_t receiveQualityFull() const { return _packet.s32(16); }
    std::int32_t receiveQualitySub() const { return _packet.s32(20); }
    bool hasReselectHysteresis() const { return _packet.u8(26) != 0; }

    RecordList<Neighbor> neighbors() const { return {_packet, 29, 14, _packet.u8(28)}; }

private:
    PacketReader _packet;
};

// GSM dedicated channel.
//
//   13  u16  ARFCN, of which the low 8 bits are shown
class LogCode_0x5076 {
public:
    static constexpr LogCode kCode = 0x5076;
    static constexpr std::size_t kMinimumLength = 17;

    explicit LogCode_0x5076(Packet packet)
        : _packet(packet)
    {
    }

    // ARFCN modulo 256: the display has never shown more of it.
    int arfcnLowByte() const { return _packet.u16(13) & 0xFF; }

private:
    PacketReader _packet;
};

// Base station identity codes of the GSM neighbours.
//
//   14     u8  number of neighbours
//   15+4i      neighbour i
class LogCode_0x51FF {
public:
    static constexpr LogCode kCode = 0x51FF;
    static constexpr std::size_t kMinimumLength = 15;

    //   0  u16  ARFCN
    //   2  u8   BSIC
    //   3  u8   not read
    class Neighbor {
    public:
        explicit Neighbor(PacketReader record)
            : _record(record)
        {
        }

        int arfcn() const { return _record.u16(0); }
        int bsic() const { return _record.u8(2); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x51FF(Packet packet)
        : _packet(packet)
    {
    }

    RecordList<Neighbor> neighbors() const { return {_packet, 15, 4, _packet.u8(14)}; }

private:
    PacketReader _packet;
};

// "GSM Serving Cell": identity and level of the serving GSM cell, from the baseband and from the telephony
// service's cell-monitor list. A row that both have shows whichever came last.
class GSMServingCell final
    : public PacketSection<LogCode_0x5134, LogCode_0x5137, LogCode_0x5076, CellMonitorList> {
public:
    GSMServingCell(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x5134& report) override;
    void update(const LogCode_0x5137& report) override;
    void update(const LogCode_0x5076& report) override;
    void update(const CellMonitorList& list) override;
};

// "Neighboring Cells": the GSM neighbours, one row dictionary each, from the baseband or from the telephony
// service's cell-monitor list, whichever came last.
class NeighboringCells final : public PacketSection<LogCode_0x5137, LogCode_0x51FF, CellMonitorList> {
public:
    NeighboringCells(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x5137& report) override;
    void update(const LogCode_0x51FF& report) override;
    void update(const CellMonitorList& list) override;

private:
    std::map<int, int> _arfcnToBsic; // of the last 0x51FF; the neighbours themselves come without BSIC
};

} // namespace orvex
