#pragma once

#include "LogGenerator.h"

#include <stdexcept>
#include <string>

namespace orvex {

// A failed assertion. Never caught, so it ends the process. what() says what failed and, in parentheses,
// where.
class AssertionFailure : public std::runtime_error {
public:
    // `file` is the source file without its suffix.
    AssertionFailure(const std::string& description, const char* method, const char* file, int line)
        : std::runtime_error(
            description + " (" + method + ", " + file + ", line " + std::to_string(line) + ")")
        , _file(file)
        , _line(line)
    {
    }

    const char* file() const { return _file; }
    int line() const { return _line; }

private:
    const char* _file;
    int _line;
};

// The generator of IFX. Its baseband sends whole displays, not packets: each message is a property list of
// texts, arrays and dictionaries in any nesting, and replaces the display before it. The generator only
// simplifies the nesting.
//
// Every message must be such a property list; anything else throws AssertionFailure. The property list
// reader bounds the nesting, and so the recursion here.
class GSMLogGenerator final : public LogGenerator {
public:
    using LogGenerator::LogGenerator;
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);

    std::vector<PacketKind> packetKinds() const override;
    // Asks for no log codes: the baseband streams everything.
    DictionaryRef getStartCommand() const override;
    void updateState(Dictionary& state, ByteView data) override;
    // The last message's display; null before the first.
    Value generateLogUsingState(Dictionary& state) override;
    ArrayRef getSaveContentsFromState(const Dictionary& state) const override;

    // A copy in which every dictionary with one entry that lies in another container is replaced by the
    // entry's value; a chain of them becomes one value. The object itself stays a dictionary. Arrays lose
    // their first element at every depth, as displays of this baseband require.
    static Value processObject(const Value& object);
    // The value of a dictionary's only entry; null for everything else.
    Value canCollapse(const Value& object) const;
};

} // namespace orvex
