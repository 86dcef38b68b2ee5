#include "DlfRecords.h"

#include "MTLDLFAddVersionReport.h"

#include <algorithm>

namespace orvex {

namespace {

constexpr std::size_t kHeaderLength = 12;
constexpr std::size_t kCodeOffset = 2;
constexpr std::size_t kTimeOffset = 4;
constexpr std::uint8_t kPrefixMark = 0x81;
constexpr std::size_t kPrefixLength = 2;
constexpr std::uint16_t kVersionReportCode = 0x1FFD;

constexpr int kDepth = 4; // records that are looked at before a reading is chosen
// What a record earns. One that fits by its length alone may be chance, one whose time is near is hardly.
constexpr int kFits = 1;
constexpr int kTimeIsNear = 8;
constexpr int kEndsTheFile = 4; // with a time that is near it earns what more records would
// Times are in whatever unit. In microseconds this is days, in the finest units of modems it is hours.
constexpr std::uint64_t kNear = std::uint64_t{1} << 40;
constexpr int kFoundAgain = kFits + kTimeIsNear; // after lost bytes

bool isLogType(std::uint8_t byte)
{
    return byte == 1 || byte == 255;
}

} // namespace

// The likelier ones first: they win when several fit equally well.
const std::array<DlfRecords::Form, 4> DlfRecords::kFormsInSnapshots = {
    {{0, true}, {kPrefixLength, true}, {0, false}, {kPrefixLength - 1, true}}};
const std::array<DlfRecords::Form, 4> DlfRecords::kForms = {
    {{0, false}, {0, true}, {kPrefixLength, true}, {kPrefixLength - 1, true}}};

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

std::optional<DlfRecords::Reading> DlfRecords::readingAt(std::size_t place, const Form& form) const
{
    if (form.prefix == kPrefixLength && _bytes.u8(place) != kPrefixMark)
        return std::nullopt;
    if (form.hasLogType && !isLogType(_bytes.u8(place + form.prefix)))
        return std::nullopt;
    return Reading{place + form.prefix + (form.hasLogType ? 1 : 0), form.hasLogType};
}

std::uint64_t DlfRecords::timeOf(std::size_t start) const
{
    return _bytes.u32(start + kTimeOffset)
        | static_cast<std::uint64_t>(_bytes.u32(start + kTimeOffset + 4)) << 32;
}

bool DlfRecords::timesAreNear(std::size_t one, std::size_t other) const
{
    const auto [earlier, later] = std::minmax({timeOf(one), timeOf(other)});
    return later - earlier < kNear;
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

bool DlfRecords::beginsWithRecords() const
{
    // Two bytes that could be a length stand at the beginning of many a file, and again where they lead to.
    // But such lengths hardly lead to the very end, nor from one time to another that is near.
    std::size_t end = 0;
    std::size_t neighbours = 0;
    std::size_t nearOnes = 0;
    for (std::size_t place = 0; fits(place); place = end) {
        end = endOf(place);
        if (fits(end)) {
            ++neighbours;
            nearOnes += timesAreNear(place, end) ? 1U : 0U;
        }
    }
    const bool makesSense = end == _bytes.size() || (neighbours > 0 && nearOnes * 2 >= neighbours);
    return end > 0 && (_isSnapshotDLF || makesSense);
}

std::optional<DlfRecords::Record> DlfRecords::next()
{
    for (; _place < _bytes.size(); ++_place, ++_skipped) {
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
            timeOf(best->start)};
    }
    return std::nullopt;
}

} // namespace orvex
