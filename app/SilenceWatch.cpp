#include "SilenceWatch.h"

#include <utility>

namespace orvex {

namespace {
using namespace std::chrono_literals;

constexpr auto kLongestPause = 10s;
} // namespace

SilenceWatch::SilenceWatch(RunLoop& runLoop, std::function<void(bool isSilent)> onChange)
    : _runLoop(runLoop)
    , _onChange(std::move(onChange))
{
}

void SilenceWatch::heard()
{
    setSilent(false);
    _timer = _runLoop.startTimer(kLongestPause, [this] { setSilent(true); });
}

void SilenceWatch::setSilent(bool isSilent)
{
    if (std::exchange(_isSilent, isSilent) != isSilent)
        _onChange(isSilent);
}

} // namespace orvex
