#include "ReportClock.h"

#include "Sampling.h"

#include <algorithm>
#include <cmath>

namespace orvex {

namespace {

std::int64_t milliseconds(Date time)
{
    return std::llround(time.secondsSince1970 * 1000);
}

template <typename Number>
void write(JsonWriter& json, Number number)
{
    json.number(static_cast<std::size_t>(number)); // of captures since the year 2000
}

} // namespace

void ReportClock::takeMessage(std::chrono::microseconds time)
{
    const std::int64_t captured = std::chrono::floor<std::chrono::milliseconds>(time).count();
    if (!_hasMessage) {
        _hasMessage = true;
        _newestTime = time;
        _first = _newest = captured;
        return;
    }
    if (time + kMessageDisorder < _newestTime) {
        _newestTime = time;
        const std::int64_t from = std::max(_newest, _last.position) + 1;
        _shift = from - captured;
        if (_shifts.size() < kLimit)
            _shifts.push_back({from, _shift});
    }
    _newestTime = std::max(_newestTime, time);
    const std::int64_t position = captured + _shift;
    if (position - _newest > kShortestGap) {
        _inGaps += position - _newest;
        if (_gaps.size() < kLimit)
            _gaps.push_back({_newest, position});
        else
            ++_gapsOmitted;
    }
    _newest = std::max(_newest, position);
}

const Moment& ReportClock::takeSample(Date time)
{
    _last.position = std::max(milliseconds(time) + _shift, _last.position);
    _last.observed = std::max(_last.position - _first - _inGaps, _last.observed);
    _last.sample = _samples++;
    return _last;
}

void ReportClock::writeJson(JsonWriter& json) const
{
    json.key("first");
    write(json, _first);
    json.key("last");
    write(json, std::max(_newest, _last.position));
    json.member("samples", _samples);
    json.key("shifts");
    json.beginArray();
    for (const Shift& shift : _shifts) {
        json.beginArray();
        write(json, shift.from);
        write(json, shift.shift);
        json.endArray();
    }
    json.endArray();
    json.key("gaps");
    json.beginArray();
    for (const Gap& gap : _gaps) {
        json.beginArray();
        write(json, gap.from);
        write(json, gap.to);
        json.endArray();
    }
    json.endArray();
    json.member("gapsOmitted", _gapsOmitted);
}

} // namespace orvex
