#pragma once

#include "Source.h"

#include "CaptureReader.h"

#include <cstdint>
#include <optional>

namespace orvex::korat {

// The messages of a capture file, pcap or DLF, once or round after round.
//
// A message is due as long after the one before it as their times in the capture are apart. Where the time
// goes back, or on by more than a minute, it says nothing about the pace: captures were joined there,
// somebody paused, or a record has no time (a DLF's version report). Such a message is due together with the
// one before it. The times of a DLF count as microseconds, as the recordings of koratd have them.
//
// A round begins a second after the last message of the one before, so that a capture whose messages are all
// due at once makes no flood. Times go on from round to round: a packet has in its header the time of the
// capture, later by the rounds before. The first round is the capture to the byte.
//
// What could not be read is reported after the first round.
class CaptureSource final : public Source {
public:
    // Why the file cannot be played, in one line; empty when its first message can be read, or it has none.
    static std::string faultOf(const std::string& path);

    CaptureSource(const std::string& path, bool once);

    std::optional<Message> next(Microseconds now) override;
    // False when the capture is played once only.
    bool restart() override;

private:
    void reportLosses(CaptureReader::Status status);
    void moveTime(Bytes& packet, std::size_t offset);

    std::string _path;
    bool _once;
    std::unique_ptr<CaptureReader> _reader;
    std::optional<Microseconds> _before; // the time of the message before
    Microseconds _due{};
    std::size_t _count = 0; // messages of all rounds
    bool _isFirstRound = true;
    std::optional<std::uint64_t> _firstPacketTime; // in the capture
    std::uint64_t _lastPacketTime = 0;
    std::uint64_t _shift = 0; // how much later packets are than in the capture
};

// Plays a capture file to every monitor, from its beginning.
class CaptureFeed final : public Feed {
public:
    CaptureFeed(std::string technology, std::string path, bool once);

    std::string start() override { return CaptureSource::faultOf(_path); }
    std::string technology() override { return _technology; }
    std::unique_ptr<Source> open(const std::string& technology) override;

private:
    std::string _technology;
    std::string _path;
    bool _once;
};

} // namespace orvex::korat
