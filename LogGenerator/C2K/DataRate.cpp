#include "C2K/DataRate.h"

namespace orvex {

void RateCounter::update(std::int32_t sequence, std::int64_t sent)
{
    const std::int64_t* lastSequence = _state[_names.sequence].integer();
    const std::int64_t* lastSent = _state[_names.sent].integer();
    const auto extraInfo = _state["ExtraInfo"].dictionary();
    if (lastSequence && lastSent) {
        publishRate(static_cast<std::uint32_t>(sequence) - static_cast<std::uint32_t>(*lastSequence),
            sent - *lastSent);
        if (extraInfo) {
            extraInfo->set(_names.sequence2, *lastSequence);
            extraInfo->set(_names.sent2, *lastSent);
        }
    } else {
        _publisher.publish(_names.rateKey, "");
    }
    _state.set(_names.sequence, sequence);
    _state.set(_names.sent, sent);
    if (extraInfo) {
        extraInfo->set(_names.sequence1, sequence);
        extraInfo->set(_names.sent1, sent);
    }
}

void RateCounter::publishRate(std::uint32_t sequenceDifference, std::int64_t sentDifference) const
{
    const auto elapsed = static_cast<std::int32_t>(sequenceDifference); // sequence numbers wrap at 32 bits
    if (elapsed < 1)
        return;
    _publisher.setText(_names.rateKey, "%.2f kbps", static_cast<double>(sentDifference) / (elapsed * 1024.0));
}

namespace {

constexpr RateCounterNames kForwardNames = {"kFLDataRate", "FLDataSeqNum", "FLDataSent", "FLDataSeqNum1",
    "FLDataSent1", "FLDataSeqNum2", "FLDataSent2"};

// Bits per packet of each format, in the baseband's order: the sizes of one group of formats, then a
// counter without data.
constexpr std::int64_t kBitsOfFormat[] = {
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
static_assert(std::size(kBitsOfFormat) == LogCode_0x1192::kFormats);

} // namespace

void ForwardLinkRate::decode(Packet packet, Dictionary& state, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x1192>(packet))
        return;
    const LogCode_0x1192 counters(packet);
    std::int64_t bits = 0;
    for (std::size_t format = 0; format < LogCode_0x1192::kFormats; ++format)
        bits += counters.packets(format) * kBitsOfFormat[format];
    RateCounter(kForwardNames, state, publisher).update(counters.sequence(), bits);
}

namespace {

constexpr RateCounterNames kReverseNames = {"kRLDataRate", "RLDataSeqNum", "RLDataSent", "RLDataSeqNum1",
    "RLDataSent1", "RLDataSeqNum2", "RLDataSent2"};

constexpr std::int64_t kBitsOfRate[] = {128, 256, 512, 768, 1024, 1536, 2048, 3072, 4096, 6144, 8192, 12288};
static_assert(std::size(kBitsOfRate) == LogCode_0x127E::kRates);

} // namespace

void ReverseLinkRate::decode(Packet packet, Dictionary& state, const Publisher& publisher)
{
    if (!hasMinimumLength<LogCode_0x127E>(packet))
        return;
    const LogCode_0x127E counters(packet);
    std::int64_t bits = 0;
    for (std::size_t rate = 0; rate < LogCode_0x127E::kRates; ++rate)
        bits += counters.packets(rate) * kBitsOfRate[rate];
    RateCounter(kReverseNames, state, publisher).update(counters.sequence(), bits);
}

} // namespace orvex
