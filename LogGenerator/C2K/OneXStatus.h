#pragma once

#include "C2K/Publisher.h"
#include "C2K/SubpacketWalk.h"
#include "PacketReader.h"

namespace orvex {

// 1x status, in subpackets. Offsets count from the start of the subpacket:
//
//   1  system state   4   u8   device state
//   2  RF             4   u8   band class of receiver 0
//                     5   u8   band class of receiver 1
//                     6   u16  channel of receiver 0
//                     8   u16  channel of receiver 1
//                     10  s8   AGC of receiver 0, 0.334 dB above -63.248 dBm
//                     11  s8   AGC of receiver 1, likewise
//                     12  s16  transmit AGC, 0.1 dBm
//   3  active set     see LogCode_0x119C_ActiveSet
//   4  finger info    only its presence matters
//
// Fields that the packet does not hold have no value.
class LogCode_0x119C {
public:
    static constexpr LogCode kCode = 0x119C;
    static constexpr std::size_t kMinimumLength = 17;

    class SystemState {
    public:
        explicit SystemState(const Subpacket& subpacket)
            : _subpacket(subpacket)
        {
        }

        std::optional<int> deviceState() const { return _subpacket.u8(4); }

    private:
        Subpacket _subpacket;
    };

    class RF {
    public:
        explicit RF(const Subpacket& subpacket)
            : _subpacket(subpacket)
        {
        }

        std::optional<int> rx0BandClass() const { return _subpacket.u8(4); }
        std::optional<int> rx1BandClass() const { return _subpacket.u8(5); }
        std::optional<int> rx0Channel() const { return _subpacket.u16(6); }
        std::optional<int> rx1Channel() const { return _subpacket.u16(8); }
        std::optional<double> rx0AGC() const { return receivedPower(_subpacket.s8(10)); }    // dBm
        std::optional<double> rx1AGC() const { return receivedPower(_subpacket.s8(11)); }    // dBm
        std::optional<double> txAGC() const { return transmittedPower(_subpacket.s16(12)); } // dBm

    private:
        static std::optional<double> receivedPower(std::optional<int> raw)
        {
            return raw ? std::optional(*raw * 334 / 1000.0 - 63.248) : std::nullopt;
        }
        static std::optional<double> transmittedPower(std::optional<int> raw)
        {
            return raw ? std::optional(*raw / 10.0) : std::nullopt;
        }

        Subpacket _subpacket;
    };

    explicit LogCode_0x119C(Packet packet)
        : _subpackets(packet)
    {
    }

    std::optional<Subpacket> systemState() const { return _subpackets.find(1); }
    std::optional<Subpacket> rf() const { return _subpackets.find(2); }
    std::optional<Subpacket> activeSet() const { return _subpackets.find(3); }
    std::optional<Subpacket> fingerInfo() const { return _subpackets.find(4); }

private:
    SubpacketWalk _subpackets;
};

// The active set within the 1x status. Offsets count from the start of the subpacket:
//
//   4   u16  m
//   6   u8   g
//   7   u8   c
//   8   u8   n, number of pilots
//   9   u8   k, number of fingers of each pilot
//   10  u16  PN of the reference pilot
//   12       pilot 0: u16 PN at 0, u16 energy at 12+4k
//
// Strength of a pilot: 2^(2c-3) energy / (9 m m g) - 1 / m. Pilots are 6k+12 bytes apart, rounded up to a
// multiple of four. Without fingers the energy of one lies where the next begins.
class LogCode_0x119C_ActiveSet {
public:
    struct Pilot {
        int pn;
        double strength; // linear, less noise; at least kFloor
    };
    static constexpr double kFloor = 0.00001; // -50 dB

    explicit LogCode_0x119C_ActiveSet(const Subpacket& subpacket)
        : _subpacket(subpacket)
    {
    }

    // False when the packet ends before the first pilot.
    bool isReadable() const { return _subpacket.contains(4, 8); }
    int count() const { return field8(8); }
    int referencePN() const { return field16(10); }
    // None when the packet does not hold the pilot's fields. Throws ArrayOutOfBoundsException at or beyond
    // the count.
    std::optional<Pilot> pilot(int index) const;

private:
    int field8(std::size_t offset) const { return _subpacket.u8(offset).value_or(0); }
    int field16(std::size_t offset) const { return _subpacket.u16(offset).value_or(0); }
    double strengthOf(int energy) const;

    Subpacket _subpacket;
};

// 1x status: device state, receivers and transmitter, active set. Outside traffic it also ends the average of
// the frame-error rate.
class OneXStatus {
public:
    static void decode(Packet packet, Dictionary& state, const Publisher& publisher);
};

} // namespace orvex
