#include "TechnologyGuess.h"

#include "TelephonyConstants.h"

#include <algorithm>
#include <stdexcept>

namespace orvex {

TechnologyGuess::TechnologyGuess(const GeneratorEnvironment& environment)
{
    for (const char* technology : telephony::kTechnologies) {
        const auto generator = LogGenerator::generatorFromTechnology(technology, environment);
        _technologies.emplace_back(technology, PacketKinds(generator->packetKinds()));
    }
}

const PacketKinds& TechnologyGuess::kindsOf(const std::string& technology) const
{
    const auto found =
        std::ranges::find(_technologies, technology, &std::pair<std::string, PacketKinds>::first);
    if (found == _technologies.end())
        throw std::invalid_argument("unknown technology " + technology);
    return found->second;
}

std::string TechnologyGuess::best(const Counts& counts) const
{
    std::string best;
    std::size_t most = 0;
    for (const auto& [technology, kinds] : _technologies) {
        std::size_t wanted = 0;
        for (const auto& [code, count] : counts)
            wanted += tellsTechnology(code) && kinds.find(code) ? count : 0;
        if (wanted > most)
            best = technology;
        else if (wanted == most)
            best.clear();
        most = std::max(most, wanted);
    }
    return best;
}

} // namespace orvex
