#pragma once

#include "CellMonitorList.h"
#include "PacketReader.h"
#include "PacketSection.h"
#include "RecordList.h"

namespace orvex {

// WCDMA cell reselection: ranked neighbours of both technologies.
//
//   13      u8  number of UMTS cells
//   14      u8  number of GSM cells
//   15+10i      UMTS cell i
//   15+7i       GSM cell i
//
// Both lists begin at the same byte: in a packet with cells of both kinds, one kind is read from the
// other's bytes.
class LogCode_0x4005 {
public:
    static constexpr LogCode kCode = 0x4005;
    static constexpr std::size_t kMinimumLength = 15;

    //   0  s16  downlink UARFCN
    //   2  u16  primary scrambling code
    //   4  s8   RSCP plus 21, dBm
    //   5  s16  RSCP in the ranking, dB
    //   7  s8   Ec/No, half dB
    //   8  s16  ranking value
    class UMTSCell {
    public:
        explicit UMTSCell(PacketReader record)
            : _record(record)
        {
        }

        int downlinkUARFCN() const { return _record.s16(0); }
        int primaryScramblingCode() const { return _record.u16(2); }
        int rscp() const { return _record.s8(4) - 21; }
        int rankingRSCP() const { return _record.s16(5); }
        double ecNo() const { return _record.s8(7) * 0.5; }
        int rankingValue() const { return _record.s16(8); }

    private:
        PacketReader _record;
    };

    //   0  u16  ARFCN
    //   2  u16  BSIC
    //   4  s8   RSSI, dBm
    //   5  s16  ranking value
    class GSMCell {
    public:
        explicit GSMCell(PacketReader record)
            : _record(record)
        {
        }

        int arfcn() const { return _record.u16(0); }
        int bsic() const { return _record.u16(2); }
        int rssi() const { return _record.s8(4); }
        int rankingValue() const { return _record.s16(5); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x4005(Packet packet)
        : _packet(packet)
    {
    }

    RecordList<UMTSCell> umtsCells() const { return {_packet, 15, 10, _packet.u8(13)}; }
    RecordList<GSMCell> gsmCells() const { return {_packet, 15, 7, _packet.u8(14)}; }

private:
    PacketReader _packet;
};

// "UMTS Set": WCDMA neighbours, one row dictionary each, from the baseband's ranking or from the telephony
// service's cell-monitor list, whichever came last. The two name and scale their rows differently.
class UMTSSet final : public PacketSection<LogCode_0x4005, CellMonitorList> {
public:
    UMTSSet(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4005& report) override;
    void update(const CellMonitorList& list) override;
};

// "GSM Set": GSM neighbours as ranked from WCDMA, one row dictionary each.
class GSMSet final : public PacketSection<LogCode_0x4005> {
public:
    GSMSet(ClassDictionary& dict, CodeDictionary& codeDict);

protected:
    void update(const LogCode_0x4005& report) override;
};

} // namespace orvex
