#pragma once

#include "LogGenerator.h"
#include "PacketKinds.h"

#include <map>
#include <string>
#include <vector>

namespace orvex {

// Tells by their log codes which technology messages are of.
class TechnologyGuess {
public:
    // How many messages have each code, by codeOfMessage().
    using Counts = std::map<LogCode, std::size_t>;

    // Creates a generator of each technology and destroys it, so the system log gets their lines.
    explicit TechnologyGuess(const GeneratorEnvironment& environment);

    // What the technology decodes.
    const PacketKinds& kindsOf(const std::string& technology) const;
    // The technology that decodes most of the messages, extra packets aside, which tell nothing. Empty when
    // none decodes any, or two as many.
    std::string best(const Counts& counts) const;

private:
    std::vector<std::pair<std::string, PacketKinds>> _technologies;
};

} // namespace orvex
