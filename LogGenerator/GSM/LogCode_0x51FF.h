#pragma once

#include "PacketReader.h"
#include "RecordList.h"

namespace orvex {

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

} // namespace orvex
