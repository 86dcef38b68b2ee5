#pragma once

#include "PacketKinds.h"
#include "RawPackets.h"

#include "Dictionary.h"
#include "MessagePort.h"
#include "RunLoop.h"
#include "Storage.h"

#include <memory>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace orvex {

// What every generator needs from the platform. The referents outlive all generators.
struct GeneratorEnvironment {
    const Resources& resources;                      // templates
    const Clock& clock;                              // dates of history entries, times of a DLF
    std::optional<std::string> buildVersion;         // of the application; absent when it has none
    std::size_t rawPacketLimit = RawPackets::kLimit; // bytes kept for snapshots; 0 for a session never saved
};

// The decoder of one log technology: turns log messages into the display dictionary.
//
// A generator keeps little itself. The session's data is in the generator state, a dictionary that the
// session creates once and passes to every call. Keys that all generators share:
//
//   "Display"       the display dictionary, into which packets write
//   "DisplayState"  the raw material of the display
//   "ExtraInfo"     values to be kept with each snapshot
//   "History"       the last displays requested, oldest first, at most five
//
// Order of calls: getStartCommand() once per session start, updateState() for every message,
// generateLogUsingState() whenever the display tree is rebuilt, getSaveContentsFromState() to save.
class LogGenerator {
public:
    explicit LogGenerator(const GeneratorEnvironment& environment);
    virtual ~LogGenerator() = default;
    LogGenerator(const LogGenerator&) = delete;
    LogGenerator& operator=(const LogGenerator&) = delete;

    // The generator of the technology with that identifier; null when there is none.
    static std::unique_ptr<LogGenerator> generatorFromTechnology(
        const Value& technology, const GeneratorEnvironment& environment);

    // Appends copies of "DisplayState", "Display" and "ExtraInfo" with the current date to "History" and
    // drops the oldest entries beyond five. The copies are shallow: an entry sees later changes inside
    // nested sections. Byte buffers are shared. The entry ends before the first of the three that is
    // absent.
    static void updateHistoryInState(Dictionary& state, const Clock& clock);

    // The packets that it decodes.
    virtual std::vector<PacketKind> packetKinds() const { return {}; }
    // What the session sends to start the stream.
    virtual DictionaryRef getStartCommand() const = 0;
    // Decodes one message, exactly as received, into the state.
    virtual void updateState(Dictionary& state, ByteView data) = 0;
    // The display to show, after a history entry for it was made. Null when there is none yet.
    virtual Value generateLogUsingState(Dictionary& state) = 0;
    // What a snapshot stores: an array of dictionaries, each with a "Description".
    virtual ArrayRef getSaveContentsFromState(const Dictionary& state) const = 0;
    // Bytes of raw messages that a snapshot lacks because they exceeded the limit.
    virtual std::size_t droppedRawBytes() const { return 0; }

    // Why the state has no display and cannot get one: which template, and what is wrong with it, in one
    // line. Empty when all is well. Nothing is logged.
    virtual std::string templateError(const Dictionary& /*state*/) const { return {}; }

protected:
    // Selects the constructor of a generator that is never set up and does not even log its creation.
    struct NeverSetUp { };
    LogGenerator(const GeneratorEnvironment& environment, NeverSetUp)
        : _environment(environment)
    {
    }

    const GeneratorEnvironment& environment() const { return _environment; }

private:
    GeneratorEnvironment _environment;
};

} // namespace orvex
