#pragma once

#include "PacketReader.h"
#include "RecordList.h"

#include <optional>

namespace orvex {

// WCDMA transmit power over the last frames.
//
//   14      u8  number of entries
//   16+14i      entry i
class LogCode_0x4031 {
public:
    static constexpr LogCode kCode = 0x4031;
    static constexpr std::size_t kMinimumLength = 16;

    //   4  s16  transmit power, tenths of a dB, see transmitPower(); 0 stands for none
    class Entry {
    public:
        explicit Entry(PacketReader record)
            : _record(record)
        {
        }

        // dBm, whole; tenths are cut off toward zero before the offset.
        std::optional<int> transmitPower() const
        {
            const int tenths = _record.s16(4);
            return tenths == 0 ? std::nullopt : std::optional((tenths + 512) / 10 - 70);
        }

    private:
        PacketReader _record;
    };

    explicit LogCode_0x4031(Packet packet)
        : _packet(packet)
    {
    }

    RecordList<Entry> entries() const { return {_packet, 16, 14, _packet.u8(14)}; }

private:
    PacketReader _packet;
};

} // namespace orvex
