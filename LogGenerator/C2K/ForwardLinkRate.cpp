#include "C2K/ForwardLinkRate.h"

#include "C2K/LogCode_0x1192.h"
#include "C2K/PacketLength.h"
#include "C2K/RateCounter.h"

namespace orvex {

namespace {

constexpr RateCounterNames kNames = {"kFLDataRate", "FLDataSeqNum", "FLDataSent", "FLDataSeqNum1",
    "FLDataSent1", "FLDataSeqNum2", "FLDataSent2"};

// Bits of a packet of each format, as the baseband orders them: the sizes of one group of formats, then a
// counter that carries no data.
constexpr std::int64_t kBitsOfPacket[] = {
    128, 256, 512, 1024, 0, //
    128, 256, 512, 1024, 0, //
    128, 256, 512, 1024, 0, //
    128, 256, 512, 1024, 0, //
    128, 256, 512, 1024, 0, //
    512, 1024, 2048, 0,     //
    128, 256, 512, 1024, 0, //
    512, 1024, 2048, 0,     //
    1024, 3072, 0,          //
    512, 1024, 2048, 0,     //
    4096, 0,                //
    1024, 3072, 0,          //
    4096, 0,                //
    5120, 0,                //
    5120, 0,                //
};
static_assert(std::size(kBitsOfPacket) == LogCode_0x1192::kFormats);

} // namespace

void ForwardLinkRate::decode(Packet packet, Dictionary& state, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x1192>(packet))
        return;
    const LogCode_0x1192 counters(packet);
    std::int64_t bits = 0;
    for (std::size_t format = 0; format < LogCode_0x1192::kFormats; ++format)
        bits += counters.packets(format) * kBitsOfPacket[format];
    RateCounter(kNames, state, publisher).update(counters.sequence(), bits);
}

} // namespace orvex
