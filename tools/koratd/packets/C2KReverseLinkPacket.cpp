#include "C2KReverseLinkPacket.h"

#include "PacketWriter.h"

namespace orvex::korat {

LogMessage C2KReverseLinkPacket::message(Microseconds time) const
{
    PacketWriter packet(kCode, time, 1750);
    packet.u32(14, sequenceNumber);
    for (std::size_t j = 0; j < kBlockCount; ++j) {
        for (std::size_t h = 0; h < kHalfCount; ++h) {
            for (std::size_t r = 0; r < kSizeCount; ++r) {
                for (std::size_t s = 0; s < kColumnCount; ++s)
                    packet.u32(18 + 576 * j + 288 * h + 24 * r + 4 * s, sizes[r].packets[j][h][s]);
            }
        }
    }
    return packet.take();
}

} // namespace orvex::korat
