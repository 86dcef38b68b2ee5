#pragma once

#include "LogMessage.h"

#include <vector>

namespace orvex::korat {

// Which cell sends on a neighbour's ARFCN, as far as its BSIC could be decoded. The measurements that follow
// name neighbours by their ARFCN alone.
//
//   14     u8  n, number of neighbours
//   15+4i  neighbour i: u16 ARFCN, u8 BSIC, 1 byte not read
struct GSMNeighborIdentityPacket {
    static constexpr LogCode kCode = 0x51FF;
    static constexpr std::size_t kLargestCount = 255;

    struct Neighbor {
        int arfcn = 0;
        int bsic = 0;
    };

    std::vector<Neighbor> neighbors;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
