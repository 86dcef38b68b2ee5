#pragma once

#include "PacketReader.h"
#include "RecordList.h"

namespace orvex {

// WCDMA block errors of the downlink transport channels.
//
//   13     u8   number of transport channels
//   14     u16  window size
//   16+9i       transport channel i
class LogCode_0x4116 {
public:
    static constexpr LogCode kCode = 0x4116;
    static constexpr std::size_t kMinimumLength = 16;

    //   0  u8   identity
    //   1  s32  CRCs received
    //   5  s32  CRCs received in error
    class TransportChannel {
    public:
        explicit TransportChannel(PacketReader record)
            : _record(record)
        {
        }

        int identity() const { return _record.u8(0); }
        std::int32_t received() const { return _record.s32(1); }
        std::int32_t receivedInError() const { return _record.s32(5); }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x4116(Packet packet)
        : _packet(packet)
    {
    }

    int windowSize() const { return _packet.u16(14); }
    RecordList<TransportChannel> transportChannels() const { return {_packet, 16, 9, _packet.u8(13)}; }

private:
    PacketReader _packet;
};

} // namespace orvex
