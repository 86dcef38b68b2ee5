#pragma once

#include "LogMessage.h"

#include <optional>

namespace orvex::korat {

// Who may use packet data in a cell, and who decides on the change of cells.
//
//   13  u8  packet flow contexts: 0 not supported, 1 supported
//   14  u8  priority access threshold
//   15  u8  network control order: 0 NC0 (the handset decides), 1 NC1 (it reports too), 2 NC2 (the network
//           decides), 255 not available
//   16  2 bytes, not read
struct GPRSNetworkControlPacket {
    static constexpr LogCode kCode = 0x51F5;

    enum class Access : std::uint8_t { barred = 0, priority1 = 3, upTo2 = 4, upTo3 = 5, upTo4 = 6, all = 7 };

    bool supportsFlowContexts = false;
    Access access = Access::all;
    std::optional<int> controlOrder; // none: not available

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
