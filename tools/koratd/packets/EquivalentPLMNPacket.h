#pragma once

#include "LogMessage.h"
#include "PLMN.h"

#include <vector>

namespace orvex::korat {

// The networks that count as the serving one when the handset looks for a cell.
//
//   16     u8  n, number of networks
//   17+3i  network i, a digit in every byte: MCC 1, MNC 1, MCC 2, MNC 2, MCC 3, MNC 3
//
// Networks lie only 3 bytes apart, so that the last three digits of each are the first three of the next,
// which wins. A list is told as it is only where they agree: MNC 2, MCC 3 and MNC 3 of the one, MCC 1, MNC 1
// and MCC 2 of the other.
struct EquivalentPLMNPacket {
    static constexpr LogCode kCode = 0x7150;
    static constexpr std::size_t kLargestCount = 255;

    std::vector<PLMN> plmns; // with network codes of three digits

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
