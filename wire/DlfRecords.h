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
// The DLF in a snapshot is less clean. It is written by dropping the first byte of each refresh interval, so
// only the first message of an interval is a bare record. The others keep their log type (1 or 255) in front,
// and before that the two-byte prefix (0x81 and any byte) if they have one; a prefix at the start of an
// interval loses its 0x81.
//
// A log type cannot be told from the low byte of a length by itself. Of the possible readings, the reader
// takes the one under which the following records fit best, judged by their lengths and by times close to
// each other. It skips bytes under which nothing fits.
class DlfRecords {
public:
    static constexpr std::size_t kHeaderLength = 12;

    // A whole file.
    explicit DlfRecords(ByteView bytes)
        : DlfRecords(bytes, true)
    {
    }
    // The first window of a file, or all of it.
    DlfRecords(ByteView window, bool isWhole);

    // Continues in the next window, which begins after the bytes that are done.
    void moveOn(ByteView window, bool reachesTheEnd);
    // Number of bytes at the front of the window that are no longer needed.
    std::size_t doneBytes() const { return _last ? std::min(*_last, _place) : _place; }
    // True if next() needs to see more of the file.
    bool wantsMore() const;

    struct Record {
        std::size_t start;                   // of the bare record, in the window
        std::optional<std::uint8_t> logType; // if present
        ByteView bytes;
        std::uint64_t time;
    };
    // None at the end, or if more is wanted. Every other call advances by at least a byte.
    std::optional<Record> next();

    std::size_t skippedBytes() const { return _skipped; }
    // Whether a file begins with records that belong together, as a DLF does. The function returns the record
    // header at an offset, possibly cut.
    static bool makeUp(std::uint64_t size, const std::function<ByteView(std::uint64_t place)>& headerAt);

private:
    // What may precede a bare record.
    struct Form {
        std::size_t prefix; // bytes
        bool hasLogType;
    };
    static const std::array<Form, 4> kFormsInSnapshots;
    static const std::array<Form, 4> kForms;

    // A possible record at an offset.
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
    bool _isSnapshotDLF; // begins with the version report that Orvex writes
    std::size_t _place = 0;
    std::optional<std::size_t> _last; // start of the previous record
    bool _isLost = false;             // the preceding bytes formed no record
    std::size_t _skipped = 0;
};

} // namespace orvex
