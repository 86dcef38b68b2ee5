#pragma once

#include "C2K/Publisher.h"
#include "PacketReader.h"
#include "RecordList.h"

namespace orvex {

// EV-DO status.
//
//   13  u8   channel, low 8 bits
//   14  u8   bits 0-2 channel, high bits; bits 3-7 band class
//   15  s8   receive AGC of antenna 0, dBm
//   16  s8   receive AGC of antenna 1, dBm
//   17  s8   transmit AGC, dBm
//   18  u16  serving PN offset, 64 chips; 65535 for none
//   36  u8   device state
//   37  u8   session state
//   38  u24  UATI, low 24 bits
//   41  u8   colour code
class LogCode_0x1183 {
public:
    static constexpr LogCode kCode = 0x1183;
    static constexpr std::size_t kLength = 50; // exactly

    static constexpr int kNoPNOffset = 65535;

    explicit LogCode_0x1183(Packet packet)
        : _packet(packet)
    {
    }

    int channel() const { return static_cast<int>(_packet.bits(13, 0, 11)); }
    int bandClass() const { return static_cast<int>(_packet.bits(14, 3, 5)); }
    int rxAGC0() const { return _packet.s8(15); } // dBm
    int rxAGC1() const { return _packet.s8(16); } // dBm
    int txAGC() const { return _packet.s8(17); }  // dBm
    int servingPNOffset() const { return _packet.u16(18); }
    int deviceState() const { return _packet.u8(36); }
    int sessionState() const { return _packet.u8(37); }
    unsigned uati24() const { return _packet.bits(38, 0, 24); }
    int colorCode() const { return _packet.u8(41); }

private:
    PacketReader _packet;
};

// EV-DO status: channel, device state, receive and transmit levels, session.
class EVDOStatus {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

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

// The pilots that the EV-DO access terminal is connected to, and their strengths.
class EVDOActiveSet {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

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

// The fingers of the EV-DO receiver: which pilot each follows, and its carrier to interference.
class EVDOFingers {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
