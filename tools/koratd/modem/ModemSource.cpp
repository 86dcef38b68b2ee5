#include "modem/ModemSource.h"

#include <algorithm>
#include <utility>

namespace orvex::korat {

namespace {
std::uint64_t wallClockTime()
{
    const auto time = std::chrono::system_clock::now().time_since_epoch();
    return static_cast<std::uint64_t>(std::chrono::duration_cast<Microseconds>(time).count());
}
} // namespace

ModemSource::ModemSource(const ModemReader& reader, std::string technology, bool withMeasurements)
    : _reader(reader)
    , _technology(std::move(technology))
    , _withMeasurements(withMeasurements)
{
}

std::optional<Message> ModemSource::next(Microseconds now)
{
    if (_waiting.empty() && (_version != _reader.version() || now >= _repeat))
        look(now);
    if (_waiting.empty())
        return std::nullopt;
    Message message = std::move(_waiting.front());
    _waiting.pop_front();
    return message;
}

void ModemSource::look(Microseconds now)
{
    _version = _reader.version();
    _repeat = now + kLongestSilence;
    for (const Content& content : contentsFor(_technology, _reader.state(), _withMeasurements)) {
        const auto [sent, isFirst] = _sent.try_emplace(content.code);
        if (isFirst || sent->second.payload != content.payload
            || now >= sent->second.time + kLongestSilence) {
            _waiting.push_back({now, content.code, messageOf(content, wallClockTime())});
            sent->second = {content.payload, now};
        }
        _repeat = std::min(_repeat, sent->second.time + kLongestSilence);
    }
}

} // namespace orvex::korat
