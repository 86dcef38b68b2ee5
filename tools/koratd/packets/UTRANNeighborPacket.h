#pragma once

#include "LogMessage.h"

#include <optional>
#include <vector>

namespace orvex::korat {

// The neighbour cells that the handset measures.
//
//   16      bits 1-7: n, number of neighbours
//   168+16i neighbour i, a bit string (the records stand far behind the count; nothing between is read):
//              0-13   UARFCN
//             14-20   cell parameter identity
//             21-28   filtered RSCP in steps of 1/256
//             29-30   set: 0 active, 1 monitored, 2 detected; 3 is none
//             31      found in the joint-detection cell set
struct UTRANNeighborPacket {
    static constexpr LogCode kCode = 0xD00A;
    static constexpr std::size_t kLargestCount = 127;

    enum class Set : std::uint8_t { active = 0, monitored = 1, detected = 2, none = 3 };

    struct Neighbor {
        int uarfcn = 0;
        int cellID = 0;
        double filteredRSCP = 0; // 0 to 1, a share of the receiver's range
        Set set = Set::none;
        bool inJointDetectionSet = false;
    };

    std::vector<Neighbor> neighbors;

    LogMessage message(Microseconds time) const;
};

} // namespace orvex::korat
