#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// The state of the 1x receiver, in four subpackets (C2KSubpacketWriter).
//
// 1, system:
//   4   u8   device state
//
// 2, radio; an AGC of the receiver is 0.334 dB from -63.248 dBm:
//   4   u8   band class of receiver 0
//   5   u8   band class of receiver 1
//   6   u16  channel of receiver 0
//   8   u16  channel of receiver 1
//   10  s8   AGC of receiver 0
//   11  s8   AGC of receiver 1
//   12  s16  AGC of the transmitter, 0.1 dBm
//
// 3, active set:
//   4   u16  m, chips that the searcher sums up coherently
//   6   u8   g, such sums that it adds up
//   7   u8   x, its scale
//   8   u8   n, number of pilots
//   9   u8   k, fingers of a pilot
//   10  u16  PN offset of the reference pilot
//   12  pilot i; pilots are 6k+12 bytes apart, made up to a multiple of 4:
//         0      u16  PN offset
//         12+4k  u16  energy
//   Energy e is a strength of 2^(2x-3) e / (9 m^2 g) - 1/m: what noise alone would give is taken off.
//
// 4, fingers: nobody reads them, but reports without this subpacket are dropped whole.
struct C2K1xStatusPacket {
    static constexpr LogCode kCode = 0x119C;
    static constexpr std::size_t kLargestCount = 255;

    enum class State : std::uint8_t { acquisition = 3, sync = 4, paging = 6, slottedSleep = 7, traffic = 8 };

    struct Receiver {
        int bandClass = 0;
        int channel = 0;
        double agc = 0; // dBm
    };

    struct Pilot {
        int pnOffset = 0;
        double strength = 0; // dB
    };

    State state = State::acquisition;
    Receiver receivers[2];  // the second one is on in traffic only
    double transmitAGC = 0; // dBm
    int referencePN = 0;
    std::vector<Pilot> pilots;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
