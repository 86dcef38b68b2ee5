#pragma once

#include "MessagePort.h"

#include "PacketReader.h"

#include <chrono>
#include <optional>

namespace orvex {

// The records of a DLF, back to back:
//
//   0   u16  length of the record
//   2   u16  log code
//   4   u64  time
//   12       payload
//
// A DLF that a snapshot holds is not so clean: of the messages of each refresh interval only the first stands
// there as such a record, the others still have their log type (1 or 255), and its prefix of two bytes where
// there is one, in front. Whether a byte is a log type or the low half of a length cannot be told from the
// byte alone; of the readings that are possible the one is taken under which the next records fit best too,
// by their lengths and by times that are near to each other. Bytes under which nothing fits are skipped.
class DlfRecords {
public:
    explicit DlfRecords(ByteView bytes);

    struct Record {
        std::size_t start;                   // of the record itself
        std::optional<std::uint8_t> logType; // when it stands in front
        ByteView bytes;
        std::uint64_t time;
    };
    // None at the end. Every call goes on by a byte at least.
    std::optional<Record> next();

    std::size_t skippedBytes() const { return _skipped; }
    // Whether the first bytes make a record: otherwise this is something else than a DLF.
    bool beginsWithRecord() const { return fits(0); }

private:
    // How a record may begin at a place.
    struct Reading {
        std::size_t start;
        bool hasLogType;
    };
    static constexpr std::size_t kReadings = 3;

    bool fits(std::size_t start) const;
    std::size_t endOf(std::size_t start) const { return start + _bytes.u16(start); }
    std::optional<Reading> readingAt(std::size_t place, std::size_t number) const;
    int scoreOf(const Reading& reading, std::optional<std::size_t> before, int depth) const;
    int bestScoreAt(std::size_t place, std::size_t before, int depth) const;
    bool timesAreNear(std::size_t one, std::size_t other) const;

    PacketReader _bytes;
    bool _isSnapshotDLF; // begins with the version report that this system writes
    std::size_t _place = 0;
    std::optional<std::size_t> _last; // start of the record before
    bool _isLost = false;             // the bytes before made no record
    std::size_t _skipped = 0;
};

} // namespace orvex
