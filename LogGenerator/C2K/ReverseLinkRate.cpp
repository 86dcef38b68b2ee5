#include "C2K/ReverseLinkRate.h"

#include "C2K/LogCode_0x127E.h"
#include "C2K/PacketLength.h"
#include "C2K/RateCounter.h"

namespace orvex {

namespace {

constexpr RateCounterNames kNames = {"kRLDataRate", "RLDataSeqNum", "RLDataSent", "RLDataSeqNum1",
    "RLDataSent1", "RLDataSeqNum2", "RLDataSent2"};

constexpr std::int64_t kBitsOfPacket[] = {
    128, 256, 512, 768, 1024, 1536, 2048, 3072, 4096, 6144, 8192, 12288};
static_assert(std::size(kBitsOfPacket) == LogCode_0x127E::kRates);

} // namespace

void ReverseLinkRate::decode(Packet packet, Dictionary& state, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x127E>(packet))
        return;
    const LogCode_0x127E counters(packet);
    std::int64_t bits = 0;
    for (std::size_t rate = 0; rate < LogCode_0x127E::kRates; ++rate)
        bits += counters.packets(rate) * kBitsOfPacket[rate];
    RateCounter(kNames, state, publisher).update(counters.sequence(), bits);
}

} // namespace orvex
