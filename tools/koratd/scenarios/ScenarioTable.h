#pragma once

#include "Scenario.h"

#include <memory>
#include <span>
#include <string>
#include <string_view>

namespace orvex::korat {

// The scenarios that koratd knows. The first one of a technology is its default.
struct ScenarioEntry {
    const char* technology;
    const char* name;
    std::unique_ptr<Scenario> (*make)(const ScenarioSettings& settings);
};

std::span<const ScenarioEntry> scenarioTable();

// An empty name asks for the technology's default. Null when there is none.
const ScenarioEntry* findScenario(std::string_view technology, std::string_view name);

// For messages: "MRL_GSM, MRL_LTE, MRL_UTRAN2", and the names of one technology's scenarios likewise.
std::string knownTechnologies();
std::string knownScenarios(std::string_view technology);

} // namespace orvex::korat
