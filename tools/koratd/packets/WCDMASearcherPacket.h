#pragma once

#include "LogMessage.h"

#include <array>
#include <optional>
#include <vector>

namespace orvex::korat {

// The WCDMA cells that the searcher finds on the frequency of the serving one.
//
//   13          s16  RSSI in steps of 0.1 from -106 dBm, less 512
//   15          u8   n, number of cells
//   16+15i      cell i: 7 bytes not read; a bit string from byte 7:
//                 0-12   primary scrambling code
//                 13-15  set
//               6 bytes not read
//   16+15n+44i  Ec/Io of cell i: 32 bytes not read, 3 times u32, a linear ratio in steps of 1/524288
//
// Readers take the first Ec/Io that is not 0. Of the set they only ask whether it is the active one.
struct WCDMASearcherPacket {
    static constexpr LogCode kCode = 0x417A;
    static constexpr std::size_t kLargestCount = 255;

    enum class Set : std::uint8_t { active = 0, monitored = 1, detected = 2 };

    struct Cell {
        int scramblingCode = 0;
        Set set = Set::active;
        std::array<std::optional<double>, 3> ecIo; // dB; none: not measured
    };

    double rssi = 0; // dBm
    std::vector<Cell> cells;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
