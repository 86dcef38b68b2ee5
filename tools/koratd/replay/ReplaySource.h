#pragma once

#include "packets/MessageSource.h"

#include "CaptureReader.h"

namespace orvex::korat {

// The messages of a capture file, pcap or DLF.
//
// A message is due as long after the one before it as their times in the capture are apart. Where the time
// goes back, or on by more than a minute, that tells nothing of a pace: captures were joined there, somebody
// paused, or a record has no time (as a DLF's version report). Such a message is due together with the one
// before it. The times of a DLF count as microseconds, as koratd writes them.
//
// A capture that is looped begins anew a second after its last message, so that one whose messages are all
// due at once makes no flood.
//
// What could not be read is reported after the first round.
class ReplaySource final : public MessageSource {
public:
    // Why the file cannot be replayed, in one line; empty when its first message can be read, or it has none.
    static std::string faultOf(const std::string& path);

    ReplaySource(const std::string& path, bool isLooped);

    std::optional<Item> nextIfAny() override;
    bool restart() override;
    // Nobody knows before the end.
    std::vector<LogCode> codes() const override { return {}; }

private:
    void reportLosses(CaptureReader::Status status);

    std::string _path;
    bool _isLooped;
    std::unique_ptr<CaptureReader> _reader;
    std::optional<Microseconds> _before; // the time of the message before
    Microseconds _due{};
    std::size_t _count = 0; // messages of all rounds
    bool _isFirstRound = true;
};

} // namespace orvex::korat
