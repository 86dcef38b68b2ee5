#include "DlfRecords.h"

#include "MTLDLFAddVersionReport.h"

#include <algorithm>

namespace orvex {

namespace {

constexpr std::size_t kHeaderLength = 12;
constexpr std::size_t kCodeOffset = 2;
constexpr std::size_t kTimeOffset = 4;
constexpr std::uint8_t kPrefixMark = 0x81;
constexpr std::uint16_t kVersionReportCode = 0x1FFD;

constexpr int kDepth = 4; // records that are looked at before a reading is chosen
// What a record earns. One that fits by its length alone may be chance, one whose time is near is hardly.
constexpr int kFits = 1;
constexpr int kTimeIsNear = 8;
constexpr int kEndsTheFile = 4;
constexpr int kFoundAgain = kFits + kTimeIsNear; // after lost bytes

bool isLogType(std::uint8_t byte)
{
    return byte == 1 || byte == 255;
}

} // namespace

DlfRecords::DlfRecords(ByteView bytes)
    : _bytes(bytes)
    , _isSnapshotDLF(
          _bytes.u16(0) == kMTLDLFVersionReportLength && _bytes.u16(kCodeOffset) == kVersionReportCode)
{
}

bool DlfRecords::fits(std::size_t start) const
{
    const std::size_t length = _bytes.u16(start);
    return length >= kHeaderLength && _bytes.contains(start, length);
}

std::optional<DlfRecords::Reading> DlfRecords::readingAt(std::size_t place, std::size_t number) const
{
    // The likelier one first: it wins when both fit equally well.
    const bool typedFirst = _isSnapshotDLF;
    if (number == (typedFirst ? 1 : 0))
        return Reading{place, false};
    if (number < 2)
        return isLogType(_bytes.u8(place)) ? std::optional(Reading{place + 1, true}) : std::nullopt;
    const bool isPrefixed = _bytes.u8(place) == kPrefixMark && isLogType(_bytes.u8(place + 2));
    return isPrefixed ? std::optional(Reading{place + 3, true}) : std::nullopt;
}

// Times are in whatever unit; in a log that goes on for hours their highest bytes stay the same.
bool DlfRecords::timesAreNear(std::size_t one, std::size_t other) const
{
    return _bytes.u16(one + kTimeOffset + 6) == _bytes.u16(other + kTimeOffset + 6);
}

int DlfRecords::scoreOf(const Reading& reading, std::optional<std::size_t> before, int depth) const
{
    if (!fits(reading.start))
        return 0;
    const int own = kFits + (before && timesAreNear(reading.start, *before) ? kTimeIsNear : 0);
    const std::size_t end = endOf(reading.start);
    if (end == _bytes.size())
        return own + kEndsTheFile;
    return own + (depth > 1 ? bestScoreAt(end, reading.start, depth - 1) : 0);
}

int DlfRecords::bestScoreAt(std::size_t place, std::size_t before, int depth) const
{
    int best = 0;
    for (std::size_t number = 0; number < kReadings; ++number) {
        if (const auto reading = readingAt(place, number))
            best = std::max(best, scoreOf(*reading, before, depth));
    }
    return best;
}

std::optional<DlfRecords::Record> DlfRecords::next()
{
    for (; _place < _bytes.size(); ++_place, ++_skipped) {
        std::optional<Reading> best;
        int bestScore = _isLost ? kFoundAgain : 0;
        for (std::size_t number = 0; number < kReadings; ++number) {
            const auto reading = readingAt(_place, number);
            const int score = reading ? scoreOf(*reading, _last, kDepth) : 0;
            if (score > bestScore) {
                bestScore = score;
                best = reading;
            }
        }
        _isLost = !best;
        if (!best)
            continue;
        const auto logType = best->hasLogType ? std::optional(_bytes.u8(best->start - 1)) : std::nullopt;
        _last = best->start;
        _place = endOf(best->start);
        const std::uint64_t time = _bytes.u32(best->start + kTimeOffset)
            | static_cast<std::uint64_t>(_bytes.u32(best->start + kTimeOffset + 4)) << 32;
        return Record{best->start, logType, _bytes.bytes().subspan(best->start, _place - best->start), time};
    }
    return std::nullopt;
}

} // namespace orvex
