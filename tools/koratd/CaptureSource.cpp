#include "CaptureSource.h"

#include "Report.h"

#include "MessageFrame.h"

#include <utility>

namespace orvex::korat {

namespace {
using namespace std::chrono_literals;

constexpr Microseconds kLongestPause = 1min;
constexpr Microseconds kPauseBetweenRounds = 1s;

constexpr std::size_t kTimeOffset = 5; // in a packet
constexpr std::size_t kTimeLength = 8;

bool isPacket(const MessageFrame& frame)
{
    return frame.isComplete()
        && (frame.logType() == MessageFrame::kTypeBaseband || frame.logType() == MessageFrame::kTypeExtra);
}
} // namespace

std::string CaptureSource::faultOf(const std::string& path)
{
    const auto reader = CaptureReader::open(path);
    return reader->next() == CaptureReader::Status::broken ? reader->error() : std::string();
}

CaptureSource::CaptureSource(const std::string& path, bool once)
    : _path(path)
    , _once(once)
    , _reader(CaptureReader::open(path))
{
}

std::optional<Message> CaptureSource::next(Microseconds /*now*/)
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
    Message message{_due, std::nullopt, Bytes(bytes.begin(), bytes.end())};
    if (const MessageFrame frame(bytes); isPacket(frame)) {
        message.code = frame.logCode();
        moveTime(message.bytes, bytes.size() - frame.packet().size() + kTimeOffset);
    }
    return message;
}

bool CaptureSource::restart()
{
    if (_once)
        return false;
    _reader = CaptureReader::open(_path);
    _before.reset();
    _due += kPauseBetweenRounds;
    if (const std::uint64_t first = _firstPacketTime.value_or(0); _lastPacketTime > first)
        _shift += _lastPacketTime - first;
    _shift += static_cast<std::uint64_t>(kPauseBetweenRounds.count());
    return true;
}

void CaptureSource::moveTime(Bytes& packet, std::size_t offset)
{
    if (packet.size() < offset + kTimeLength) // a packet behind a prefix may be that short
        return;
    const PacketReader reader(packet);
    _lastPacketTime = reader.u32(offset) | static_cast<std::uint64_t>(reader.u32(offset + 4)) << 32;
    _firstPacketTime = _firstPacketTime.value_or(_lastPacketTime);
    for (std::size_t i = 0; i < kTimeLength; ++i)
        packet[offset + i] = static_cast<std::uint8_t>((_lastPacketTime + _shift) >> (8 * i));
}

void CaptureSource::reportLosses(CaptureReader::Status status)
{
    if (!_isFirstRound)
        return;
    _isFirstRound = false;
    if (const std::string omissions = _reader->omissions(); !omissions.empty())
        report("%s: %s", _path.c_str(), omissions.c_str());
    if (status == CaptureReader::Status::broken)
        report("%s (after %zu messages)", _reader->error().c_str(), _count);
}

CaptureFeed::CaptureFeed(std::string technology, std::string path, bool once)
    : _technology(std::move(technology))
    , _path(std::move(path))
    , _once(once)
{
}

std::unique_ptr<Source> CaptureFeed::open(const std::string& /*technology*/)
{
    return std::make_unique<CaptureSource>(_path, _once);
}

} // namespace orvex::korat
