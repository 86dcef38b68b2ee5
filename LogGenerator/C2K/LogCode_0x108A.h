#pragma once

#include "RecordList.h"

namespace orvex {

// EV-DO fingers.
//
//   22      u8   n, number of fingers
//   23+14i       finger i:
//                0  u16  PN, 65535 for an idle finger
//                6  u16  carrier to interference, 512 for 0 dB
class LogCode_0x108A {
public:
    static constexpr LogCode kCode = 0x108A;
    static constexpr std::size_t kMinimumLength = 23;

    class Finger {
    public:
        explicit Finger(PacketReader record)
            : _record(record)
        {
        }

        bool isIdle() const { return pn() == 65535; }
        int pn() const { return _record.u16(0); }
        double carrierToInterference() const { return _record.u16(6) / 512.0; } // linear

    private:
        PacketReader _record;
    };

    explicit LogCode_0x108A(Packet packet)
        : _packet(packet)
    {
    }

    // True when the packet ends with its last finger.
    bool holdsJustItsFingers() const
    {
        return _packet.size() == kMinimumLength + kFingerLength * fingers().count();
    }
    RecordList<Finger> fingers() const { return {_packet, kMinimumLength, kFingerLength, _packet.u8(22)}; }

private:
    static constexpr std::size_t kFingerLength = 14;

    PacketReader _packet;
};

} // namespace orvex
