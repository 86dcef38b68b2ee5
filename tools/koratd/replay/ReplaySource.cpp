#include "ReplaySource.h"

#include "service/Report.h"

#include "MessageFrame.h"

namespace orvex::korat {

namespace {
using namespace std::chrono_literals;

constexpr Microseconds kLongestPause = 1min;
constexpr Microseconds kPauseBetweenRounds = 1s;

// By which code the client subscribes to a message. None for what is no packet: property lists, and garbage,
// which is nobody's in particular.
std::optional<LogCode> codeOf(ByteView bytes)
{
    const MessageFrame message(bytes);
    const bool isPacket = message.isComplete()
        && (message.logType() == MessageFrame::kTypeBaseband
            || message.logType() == MessageFrame::kTypeExtra);
    return isPacket ? std::optional(message.logCode()) : std::nullopt;
}
} // namespace

std::string ReplaySource::faultOf(const std::string& path)
{
    const auto reader = CaptureReader::open(path);
    return reader->next() == CaptureReader::Status::broken ? reader->error() : std::string();
}

ReplaySource::ReplaySource(const std::string& path, bool isLooped)
    : _path(path)
    , _isLooped(isLooped)
    , _reader(CaptureReader::open(path))
{
}

std::optional<MessageSource::Item> ReplaySource::nextIfAny()
{
    const CaptureReader::Status status = _reader->next();
    if (status != CaptureReader::Status::message) {
        reportLosses(status);
        return std::nullopt;
    }
    const Microseconds pause = _reader->time() - _before.value_or(_reader->time());
    if (pause >= 0us && pause <= kLongestPause)
        _due += pause;
    _before = _reader->time();
    ++_count;
    const ByteView bytes = _reader->message();
    return Item{_due, {codeOf(bytes), Bytes(bytes.begin(), bytes.end())}};
}

bool ReplaySource::restart()
{
    if (!_isLooped)
        return false;
    _reader = CaptureReader::open(_path);
    _before.reset();
    _due += kPauseBetweenRounds;
    return true;
}

void ReplaySource::reportLosses(CaptureReader::Status status)
{
    if (!_isFirstRound)
        return;
    _isFirstRound = false;
    if (const std::string omissions = _reader->omissions(); !omissions.empty())
        report("%s: %s", _path.c_str(), omissions.c_str());
    if (status == CaptureReader::Status::broken)
        report("%s (after %zu messages)", _reader->error().c_str(), _count);
}

} // namespace orvex::korat
