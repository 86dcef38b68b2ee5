#pragma once

#include "GeneratorEnvironment.h"

#include "Dictionary.h"
#include "MessagePort.h"

#include <memory>

namespace orvex {

// The decoder of one log technology: turns log messages into the display dictionary.
//
// A generator keeps little of its own. What a session knows lies in the generator state, a dictionary that
// the session makes once and hands to every call. Keys that all generators share:
//
//   "Display"       the display dictionary, into which packets write
//   "DisplayState"  the raw material of the display
//   "ExtraInfo"     values to be kept with each snapshot
//   "History"       the last displays that were asked for, oldest first, at most five
//
// Order of calls: getStartCommand() once per session start, updateState() for every message,
// generateLogUsingState() whenever the display tree is rebuilt, getSaveContentsFromState() to save.
class LogGenerator {
public:
    explicit LogGenerator(const GeneratorEnvironment& environment);
    virtual ~LogGenerator() = default;
    LogGenerator(const LogGenerator&) = delete;
    LogGenerator& operator=(const LogGenerator&) = delete;

    // The generator for the identifier that the telephony service gives its technology; null when nothing
    // decodes it.
    static std::unique_ptr<LogGenerator> generatorFromTechnology(
        const Value& technology, const GeneratorEnvironment& environment);

    // Appends copies of "DisplayState", "Display" and "ExtraInfo" with the current date to "History" and
    // drops the oldest entries beyond five. The copies are shallow: an entry keeps seeing what happens inside
    // nested sections. Bytes are shared. The entry ends before the first of the three that is absent.
    static void updateHistoryInState(Dictionary& state, const Clock& clock);

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
    // Marks the construction of a generator on which no set-up runs, not even the log line of its birth.
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
