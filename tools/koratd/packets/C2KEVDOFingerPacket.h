#pragma once

#include "LogMessage.h"

#include <optional>
#include <vector>

namespace orvex::korat {

// The fingers of the EV-DO receiver, each of which follows one path of one pilot.
//
//   22      u8  n, number of fingers
//   23+14i  finger i:
//             0  u16  PN offset; 65535 while the finger follows nothing
//             6  u16  carrier to interference as a ratio in steps of 1/512
struct C2KEVDOFingerPacket {
    static constexpr LogCode kCode = 0x108A;
    static constexpr std::size_t kLargestCount = 255;

    struct Finger {
        std::optional<int> pnOffset;
        double carrierToInterference = 0; // dB
    };

    std::vector<Finger> fingers;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
