#include "CaptureSampler.h"

#include "CaptureClock.h"

#include "TextFormat.h"

#include <algorithm>

namespace orvex {

namespace {
using std::chrono::microseconds;
}

CaptureSampler::CaptureSampler(const Sampling& sampling, OfflineSession& session, TimelineOutput& output)
    : _session(session)
    , _output(output)
    , _fields(sampling.fields)
    , _timeline(_fields, output)
    , _every(sampling.every)
{
}

void CaptureSampler::take(ByteView message, microseconds time)
{
    ++_messages;
    if (captureDate(time))
        advance(time);
    _output.message(message, time);
}

void CaptureSampler::advance(microseconds time)
{
    if (!_newest) {
        _next = time + _every;
    } else if (time + kMessageDisorder < *_newest) {
        goBack(time);
        return;
    } else if (time >= _next) {
        sample(_next);
        _next += ((time - _next) / _every + 1) * _every;
    }
    _newest = std::max(time, _newest.value_or(time));
}

void CaptureSampler::goBack(microseconds time)
{
    if (_jumps++ == 0)
        _firstJump = {*_newest - time, _messages};
    sample(*_newest);
    _newest = time;
    _next = time + _every;
}

bool CaptureSampler::finish()
{
    if (_newest)
        sample(*_newest);
    return _newest.has_value();
}

void CaptureSampler::sample(microseconds time)
{
    // In milliseconds, as all outputs show it.
    const auto whole = std::chrono::floor<std::chrono::milliseconds>(time);
    _timeline.sample({std::chrono::duration<double>(whole).count()}, _session.shown());
}

std::string CaptureSampler::clockNote() const
{
    if (_jumps == 0)
        return {};
    std::string more;
    if (_jumps > 1)
        more = _jumps == 2 ? ", and once after that" : text(", and %zu times after that", _jumps - 1);
    return text("the clock goes back by %.3f s at message %zu%s; times are as captured",
        std::chrono::duration<double>(_firstJump->back).count(), _firstJump->message, more.c_str());
}

} // namespace orvex
