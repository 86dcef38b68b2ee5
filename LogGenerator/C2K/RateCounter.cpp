#include "C2K/RateCounter.h"

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

} // namespace orvex
