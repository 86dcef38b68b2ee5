#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// The pilots of the EV-DO active set.
//
//   15      u8  n, number of pilots
//   25+12i  pilot i: u16 PN offset, u16 strength as a ratio in steps of 1/512
struct C2KEVDOActiveSetPacket {
    static constexpr LogCode kCode = 0x12B6;
    static constexpr std::size_t kLargestCount = 255;

    struct Pilot {
        int pnOffset = 0;
        double strength = 0; // dB, down to -27
    };

    std::vector<Pilot> pilots;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
