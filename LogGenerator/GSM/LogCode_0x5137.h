#pragma once

#include "PacketReader.h"
#include "RecordList.h"

namespace orvex {

// GSM surround cells, as seen from the serving one. Four sections read it, and two of them take the same
// bytes for different things: 16 to 23 are C1 and C2 to one and the receive qualities to another.
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

} // namespace orvex
