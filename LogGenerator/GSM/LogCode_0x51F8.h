#pragma once

#include "PacketReader.h"
#include "RecordList.h"

namespace orvex {

// GSM mobile allocation: the channels of frequency hopping.
//
//   13     u8   hopping sequence number
//   14     u8   number of channels
//   15+2i  u16  ARFCN i
class LogCode_0x51F8 {
public:
    static constexpr LogCode kCode = 0x51F8;
    static constexpr std::size_t kMinimumLength = 15;

    class Channel {
    public:
        explicit Channel(PacketReader record)
            : _record(record)
        {
        }

        int arfcn() const { return _record.u16(0); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x51F8(Packet packet)
        : _packet(packet)
    {
    }

    int hoppingSequenceNumber() const { return _packet.u8(13); }
    RecordList<Channel> channels() const { return {_packet, 15, 2, _packet.u8(14)}; }

private:
    PacketReader _packet;
};

} // namespace orvex
