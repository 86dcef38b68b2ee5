#pragma once

#include "RecordList.h"

namespace orvex {

// EV-DO active set.
//
//   15      u8   n, number of pilots
//   25+12i       pilot i: u16 PN, u16 strength, 512 for 0 dB
class LogCode_0x12B6 {
public:
    static constexpr LogCode kCode = 0x12B6;
    static constexpr std::size_t kMinimumLength = 25;

    class Pilot {
    public:
        explicit Pilot(PacketReader record)
            : _record(record)
        {
        }

        int pn() const { return _record.u16(0); }
        double strength() const { return _record.u16(2) / 512.0; } // linear

    private:
        PacketReader _record;
    };

    explicit LogCode_0x12B6(Packet packet)
        : _packet(packet)
    {
    }

    bool holdsAllPilots() const { return _packet.size() >= kMinimumLength + kPilotLength * pilots().count(); }
    RecordList<Pilot> pilots() const { return {_packet, kMinimumLength, kPilotLength, _packet.u8(15)}; }

private:
    static constexpr std::size_t kPilotLength = 12;

    PacketReader _packet;
};

} // namespace orvex
