#pragma once

#include "LogMessage.h"

#include <optional>
#include <vector>

namespace orvex::korat {

// The power that the handset sent with lately.
//
//   14      u8  n, number of entries
//   16+14i  entry i: 4 bytes not read, s16 power in steps of 0.1 from -70 dBm, less 512, or 0 for none;
//           8 bytes not read
struct WCDMATransmitPowerPacket {
    static constexpr LogCode kCode = 0x4031;
    static constexpr std::size_t kLargestCount = 255;

    std::vector<std::optional<double>> powers; // dBm; none: nothing was sent

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
