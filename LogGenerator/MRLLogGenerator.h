#pragma once

#include "LogGenerator.h"

namespace orvex {

// A generator that keeps the raw packets of each refresh interval and can put them into a DLF, the binary
// log that accompanies a snapshot.
//
// A DLF is a flat sequence of records: u16 length (the record's own), u16 log code, 8 bytes time, payload.
// A log packet is such a record once its first byte, the log type, is removed.
class MRLLogGenerator : public LogGenerator {
public:
    explicit MRLLogGenerator(const GeneratorEnvironment& environment);

    // The version report followed by the raw packets of the history. Only the first byte of every history
    // entry is dropped: later packets of an entry keep their log type, and readers of these files know it.
    // Null, with a log line, when an entry's "DisplayState" is something else than bytes.
    BytesRef generateDlfFromState(const Dictionary& state) const;

    // The history entries and, last, the DLF.
    ArrayRef getSaveContentsFromState(const Dictionary& state) const override;

protected:
    // Without a buffer until the first display request.
    MRLLogGenerator(const GeneratorEnvironment& environment, NeverSetUp tag)
        : LogGenerator(environment, tag)
    {
    }

    // Moves the packets gathered so far into the state's "DisplayState" and starts anew.
    void handOverBinData(Dictionary& state);

    BytesRef _binData; // every message since the last display request, in order of arrival
};

} // namespace orvex
