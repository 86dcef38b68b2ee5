#include "DlfRecords.h"

#include "MTLDLFAddVersionReport.h"
#include "MessageFrame.h"

#include <algorithm>

namespace orvex {

namespace {

constexpr std::size_t kCodeOffset = 2;
constexpr std::size_t kTimeOffset = 4;
constexpr std::uint8_t kPrefixMark = MessageFrame::kPrefixMark;
constexpr std::size_t kPrefixLength = MessageFrame::kPrefixLength;
constexpr std::uint16_t kVersionReportCode = 0x1FFD;

constexpr int kDepth = 4; // records to look ahead before choosing a reading
// Score: a plausible length may be chance; a plausible time rarely is.
constexpr int kFits = 1;
constexpr int kTimeIsNear = 8;
constexpr int kEndsTheFile = 4; // makes up for the records that cannot follow
// Any unit: 12 days in microseconds, hours in the finest units that modems use.
constexpr std::uint64_t kNear = std::uint64_t{1} << 40;
constexpr int kFoundAgain = kFits + kTimeIsNear; // needed after skipped bytes

// The farthest that any decision on a record looks ahead.
constexpr std::size_t kLookAhead = (kDepth + 1) * (UINT16_MAX + kPrefixLength + 1);
// After this many records with plausible times the file is a DLF, whatever follows.
constexpr std::size_t kEnoughRecords = 4096;

std::uint64_t timeIn(PacketReader header)
{
    return header.u32(kTimeOffset) | static_cast<std::uint64_t>(header.u32(kTimeOffset + 4)) << 32;
}

bool areNear(std::uint64_t one, std::uint64_t other)
{
    const auto [earlier, later] = std::minmax(one, other);
    return later - earlier < kNear;
}

bool isVersionReport(PacketReader header)
{
    return header.u16(0) == kMTLDLFVersionReportLength && header.u16(kCodeOffset) == kVersionReportCode;
}

bool isLogType(std::uint8_t byte)
{
    return byte == MessageFrame::kTypeBaseband || byte == MessageFrame::kTypeExtra;
}

} // namespace

// Likelier forms first: they win ties.
const std::array<DlfRecords::Form, 4> DlfRecords::kFormsInSnapshots = {
    {{0, true}, {kPrefixLength, true}, {0, false}, {kPrefixLength - 1, true}}};
const std::array<DlfRecords::Form, 4> DlfRecords::kForms = {
    {{0, false}, {0, true}, {kPrefixLength, true}, {kPrefixLength - 1, true}}};

DlfRecords::DlfRecords(ByteView window, bool isWhole)
    : _bytes(window)
    , _reachesTheEnd(isWhole)
    , _isSnapshotDLF(isVersionReport(_bytes))
{
}

void DlfRecords::moveOn(ByteView window, bool reachesTheEnd)
{
    const std::size_t done = doneBytes();
    if (_bytes.size() == 0)
        _isSnapshotDLF = isVersionReport(PacketReader(window));
    _bytes = PacketReader(window);
    _reachesTheEnd = reachesTheEnd;
    _place -= done;
    if (_last)
        *_last -= done;
}

bool DlfRecords::wantsMore() const
{
    return !_reachesTheEnd && _bytes.size() - _place < kLookAhead;
}

bool DlfRecords::fits(std::size_t start) const
{
    const std::size_t length = _bytes.u16(start);
    return length >= kHeaderLength && _bytes.contains(start, length);
}

std::optional<DlfRecords::Reading> DlfRecords::readingAt(std::size_t place, const Form& form) const
{
    if (form.prefix == kPrefixLength && _bytes.u8(place) != kPrefixMark)
        return std::nullopt;
    if (form.hasLogType && !isLogType(_bytes.u8(place + form.prefix)))
        return std::nullopt;
    return Reading{place + form.prefix + (form.hasLogType ? 1 : 0), form.hasLogType};
}

bool DlfRecords::timesAreNear(std::size_t one, std::size_t other) const
{
    return areNear(timeIn(_bytes.from(one)), timeIn(_bytes.from(other)));
}

int DlfRecords::scoreOf(const Reading& reading, std::optional<std::size_t> before, int depth) const
{
    if (!fits(reading.start))
        return 0;
    const bool isNear = before && timesAreNear(reading.start, *before);
    const int own = isNear ? kFits + kTimeIsNear : kFits;
    const std::size_t end = endOf(reading.start);
    if (end == _bytes.size())
        return own + (isNear ? (depth - 1) * (kFits + kTimeIsNear) : kEndsTheFile);
    return own + (depth > 1 ? bestScoreAt(end, reading.start, depth - 1) : 0);
}

int DlfRecords::bestScoreAt(std::size_t place, std::size_t before, int depth) const
{
    int best = 0;
    for (const Form& form : forms()) {
        if (const auto reading = readingAt(place, form))
            best = std::max(best, scoreOf(*reading, before, depth));
    }
    return best;
}

bool DlfRecords::makeUp(std::uint64_t size, const std::function<ByteView(std::uint64_t place)>& headerAt)
{
    // Many files begin with two bytes that could be a length, and have such bytes again where it leads. But
    // such lengths rarely lead exactly to the end, or from one time to a near one.
    std::uint64_t end = 0;
    std::size_t neighbours = 0;
    std::size_t nearOnes = 0;
    std::uint64_t timeBefore = 0;
    const auto isMostlyNear = [&] { return neighbours > 0 && nearOnes * 2 >= neighbours; };
    while (end < size) {
        const PacketReader header(headerAt(end));
        const std::size_t length = header.u16(0);
        if (length < kHeaderLength || length > size - end)
            break;
        if (end == 0 && isVersionReport(header))
            return true;
        if (end > 0) {
            ++neighbours;
            nearOnes += areNear(timeBefore, timeIn(header)) ? 1U : 0U;
        }
        if (neighbours == kEnoughRecords && isMostlyNear())
            return true;
        timeBefore = timeIn(header);
        end += length;
    }
    return end > 0 && (end == size || isMostlyNear());
}

std::optional<DlfRecords::Record> DlfRecords::next()
{
    for (; _place < _bytes.size() && !wantsMore(); ++_place, ++_skipped) {
        std::optional<Reading> best;
        int bestScore = _isLost ? kFoundAgain : 0;
        for (const Form& form : forms()) {
            const auto reading = readingAt(_place, form);
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
        return Record{best->start, logType, _bytes.bytes().subspan(best->start, _place - best->start),
            timeIn(_bytes.from(best->start))};
    }
    return std::nullopt;
}

} // namespace orvex
