#pragma once

#include "C2K/SubpacketWalk.h"

namespace orvex {

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
// Strength of a pilot: 2^(2c-3) energy / (9 m m g) - 1 / m.
// Pilots are 6k+12 bytes apart, rounded up to a multiple of four. Without fingers the energy of one lies
// where the next begins.
class LogCode_0x119C_ActiveSet {
public:
    struct Pilot {
        int pn;
        double strength; // linear, the noise taken off; at least kFloor
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

} // namespace orvex
