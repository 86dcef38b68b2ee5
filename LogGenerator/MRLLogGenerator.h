#pragma once

#include "LogGenerator.h"
#include "RawPackets.h"

#include <optional>

namespace orvex {

// A generator that keeps the raw packets of each refresh interval and can put them into a DLF, the binary
// log that accompanies a snapshot.
//
// A DLF is a flat sequence of records: u16 length (the record's own), u16 log code, 8 bytes time, payload.
// A log packet is such a record once its first byte, the log type, is removed.
//
// Memory is bounded whatever the peer sends: an interval keeps what RawPackets keeps, and the history as a
// whole no more than one interval may. When a new interval does not fit beside the older ones, the oldest
// entries lose all their packets; their displays stay.
class MRLLogGenerator : public LogGenerator {
public:
    explicit MRLLogGenerator(const GeneratorEnvironment& environment);

    // The version report followed by the raw packets of the history. Only the first byte of each history
    // entry is dropped, so the later packets of an entry keep their log type; readers of these files expect
    // that. The packets are not copied. None, with a log line, when the "DisplayState" of an entry is not a
    // byte buffer.
    std::optional<PiecedBytes> generateDlfFromState(const Dictionary& state) const;

    // The history entries and, last, the DLF.
    ArrayRef getSaveContentsFromState(const Dictionary& state) const override;

    std::size_t droppedRawBytes() const override
    {
        return _droppedFromHistory + (_binData ? _binData->droppedBytes() : 0);
    }

protected:
    // Without a buffer until the first display request.
    MRLLogGenerator(const GeneratorEnvironment& environment, NeverSetUp tag)
        : LogGenerator(environment, tag)
    {
    }

    // Moves the packets gathered so far into the state's "DisplayState" and starts over.
    void handOverBinData(Dictionary& state);

    std::optional<RawPackets> _binData; // since the last display request

private:
    std::size_t _droppedFromHistory = 0;
};

} // namespace orvex
