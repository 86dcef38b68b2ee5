#pragma once

#include "Value.h"

#include "PacketReader.h"

#include <algorithm>
#include <array>
#include <functional>
#include <optional>

namespace orvex {

// The records of a DLF, back to back:
//
//   0   u16  length of the record
//   2   u16  log code
//   4   u64  time
//   12       payload
//
// A DLF that a snapshot holds is not so clean. It was written by dropping the first byte of each refresh
// interval, so that only the first message of an interval stands there as such a record. The others still
// have their log type (1 or 255) in front, and before it, where there is one, a prefix of two bytes, 0x81 and
// any other; of a prefix that begins an interval the second byte is left.
//
// Whether a byte is a log type or the low half of a length cannot be told from the byte alone; of the
// readings that are possible the one is taken under which the next records fit best too, by their lengths and
// by times that are near to each other. Bytes under which nothing fits are skipped.
class DlfRecords {
public:
    static constexpr std::size_t kHeaderLength = 12;

    // Of a whole file.
    explicit DlfRecords(ByteView bytes)
        : DlfRecords(bytes, true)
    {
    }
    // Of the beginning of a file, unless it is whole.
    DlfRecords(ByteView window, bool isWhole);

    // Goes on in a later window of the file, which begins behind the bytes that are done.
    void moveOn(ByteView window, bool reachesTheEnd);
    // How many bytes at the front of the window are needed no more.
    std::size_t doneBytes() const { return _last ? std::min(*_last, _place) : _place; }
    // True when next() needs to see more of the file.
    bool wantsMore() const;

    struct Record {
        std::size_t start;                   // of the record itself, in the window
        std::optional<std::uint8_t> logType; // when it stands in front
        ByteView bytes;
        std::uint64_t time;
    };
    // None at the end, or when more is wanted. Every other call goes on by a byte at least.
    std::optional<Record> next();

    std::size_t skippedBytes() const { return _skipped; }
    // Whether the first bytes make records that belong together: otherwise this is something else than a DLF.
    bool beginsWithRecords() const;
    // The same for a file of any size, whose header at a place, or what there is of it, the function returns.
    static bool makeUp(std::uint64_t size, const std::function<ByteView(std::uint64_t place)>& headerAt);

private:
    // What may stand before a record: so many bytes of a prefix, and a log type.
    struct Form {
        std::size_t prefix;
        bool hasLogType;
    };
    static const std::array<Form, 4> kFormsInSnapshots;
    static const std::array<Form, 4> kForms;

    // How the record at a place may begin.
    struct Reading {
        std::size_t start;
        bool hasLogType;
    };
    const std::array<Form, 4>& forms() const { return _isSnapshotDLF ? kFormsInSnapshots : kForms; }
    bool fits(std::size_t start) const;
    std::size_t endOf(std::size_t start) const { return start + _bytes.u16(start); }
    std::optional<Reading> readingAt(std::size_t place, const Form& form) const;
    int scoreOf(const Reading& reading, std::optional<std::size_t> before, int depth) const;
    int bestScoreAt(std::size_t place, std::size_t before, int depth) const;
    bool timesAreNear(std::size_t one, std::size_t other) const;

    PacketReader _bytes;
    bool _reachesTheEnd; // of the file
    bool _isSnapshotDLF; // begins with the version report that this system writes
    std::size_t _place = 0;
    std::optional<std::size_t> _last; // start of the record before
    bool _isLost = false;             // the bytes before made no record
    std::size_t _skipped = 0;
};

} // namespace orvex
