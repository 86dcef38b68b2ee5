#pragma once

#include "LogGenerator.h"
#include "PacketKinds.h"

#include <map>
#include <string>
#include <vector>

namespace orvex {

// Guesses the technology of messages by their log codes.
class TechnologyGuess {
public:
    // Number of messages per codeOfMessage().
    using Counts = std::map<LogCode, std::size_t>;

    // Creates and destroys a generator of each technology, which writes lines to the system log.
    explicit TechnologyGuess(const GeneratorEnvironment& environment);

    // What the technology decodes.
    const PacketKinds& kindsOf(const std::string& technology) const;
    // The technology that decodes most of the messages, not counting extra packets. Empty if none decodes
    // any, or if two decode equally many.
    std::string best(const Counts& counts) const;

private:
    std::vector<std::pair<std::string, PacketKinds>> _technologies;
};

} // namespace orvex
