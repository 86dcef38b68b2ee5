#pragma once

#include "LogGenerator.h"

namespace orvex {

// The generator of IFX. Its baseband sends whole displays, not packets: each message is a property list of
// texts, arrays and dictionaries in any nesting, and replaces the display before it. The generator only
// simplifies the nesting.
//
// Every message must be such a property list; anything else throws AssertionFailure. How deep a list may nest
// is bounded by its reader, and so is the recursion over it.
class GSMLogGenerator final : public LogGenerator {
public:
    using LogGenerator::LogGenerator;
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);

    // Asks for no log codes: the baseband streams everything.
    DictionaryRef getStartCommand() const override;
    void updateState(Dictionary& state, ByteView data) override;
    // The last message's display; null before the first.
    Value generateLogUsingState(Dictionary& state) override;
    ArrayRef getSaveContentsFromState(const Dictionary& state) const override;

    // A new object in which a dictionary of one entry is its entry's value, wherever it lies in another
    // container; a chain of such dictionaries becomes one value. The object itself stays a dictionary.
    // Arrays, at every depth, lose their first element: this is how displays of this baseband read.
    static Value processObject(const Value& object);
    // The value of a dictionary's only entry; null for everything else.
    Value canCollapse(const Value& object) const;
};

} // namespace orvex
