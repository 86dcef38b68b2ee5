#include "ScenarioTable.h"

#include "C2KTownScenario.h"
#include "GSMTownScenario.h"
#include "IFXTownScenario.h"
#include "LTETownScenario.h"
#include "UTRANTownScenario.h"

#include "TelephonyConstants.h"

namespace orvex::korat {

namespace {
template <typename Kind>
std::unique_ptr<Scenario> make(const ScenarioSettings& settings)
{
    return std::make_unique<Kind>(settings);
}

constexpr ScenarioEntry kScenarios[] = {
    {telephony::kTechnologyMRL_GSM, "town", make<GSMTownScenario>},
    {telephony::kTechnologyMRL_LTE, "town", make<LTETownScenario>},
    {telephony::kTechnologyMRL_UTRAN2, "town", make<UTRANTownScenario>},
    {telephony::kTechnologyMRL_CDMA, "town", make<C2KTownScenario>},
    {telephony::kTechnologyIFX, "town", make<IFXTownScenario>},
};

void append(std::string& list, std::string_view name)
{
    if (!list.empty())
        list += ", ";
    list += name;
}
} // namespace

std::span<const ScenarioEntry> scenarioTable()
{
    return kScenarios;
}

const ScenarioEntry* findScenario(std::string_view technology, std::string_view name)
{
    for (const ScenarioEntry& entry : kScenarios) {
        if (entry.technology == technology && (name.empty() || entry.name == name))
            return &entry;
    }
    return nullptr;
}

std::string knownTechnologies()
{
    std::string result;
    std::string_view last;
    for (const ScenarioEntry& entry : kScenarios) { // a technology's scenarios stand together
        if (entry.technology != last)
            append(result, entry.technology);
        last = entry.technology;
    }
    return result;
}

std::string knownScenarios(std::string_view technology)
{
    std::string result;
    for (const ScenarioEntry& entry : kScenarios) {
        if (entry.technology == technology)
            append(result, entry.name);
    }
    return result;
}

} // namespace orvex::korat
