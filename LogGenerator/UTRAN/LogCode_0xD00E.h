#pragma once

#include "PacketReader.h"
#include "RecordList.h"

namespace orvex {

// UTRAN measurement of GSM neighbours.
//
//   16     u8  number of neighbours
//   17+8i  neighbour i
class LogCode_0xD00E {
public:
    static constexpr LogCode kCode = 0xD00E;
    static constexpr std::size_t kMinimumLength = 17;

    //   0  u16  bits 0-13 cell identity, bit 14 band indicator, bit 15 BSIC valid
    //   2  u8   network colour code
    //   3  u8   base station colour code
    //   4  u16  ARFCN
    //   6  s16  RSSI
    class GSMNeighbor {
    public:
        explicit GSMNeighbor(PacketReader record)
            : _record(record)
        {
        }

        int cellIdentity() const { return static_cast<int>(_record.bits(0, 0, 14)); }
        int bandIndicator() const { return static_cast<int>(_record.bits(1, 6, 1)); }
        int bsicValid() const { return static_cast<int>(_record.bits(1, 7, 1)); }
        int ncc() const { return _record.u8(2); }
        int bcc() const { return _record.u8(3); }
        int arfcn() const { return _record.u16(4); }
        int rssi() const { return _record.s16(6); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0xD00E(Packet packet)
        : _packet(packet)
    {
    }

    RecordList<GSMNeighbor> neighbors() const { return {_packet, 17, 8, _packet.u8(16)}; }

private:
    PacketReader _packet;
};

} // namespace orvex
