#pragma once

#include "scenarios/ScenarioTable.h"
#include "service/Faults.h"

#include <optional>
#include <string>
#include <vector>

namespace orvex::korat {

// What the command line asks for.
struct Options {
    const ScenarioEntry* scenario = nullptr; // names the technology too
    std::optional<double> rate;              // messages per second; none: the scenario's natural pace
    std::optional<std::uint64_t> count;      // messages to a client, after which its stream rests
    std::uint64_t seed = 1;
    Faults faults;
};

struct OptionsResult {
    std::optional<Options> options;
    std::string text;  // without options: what to print instead, help or version...
    std::string error; // ... or why the line is wrong; the text is the usage then
};

// The arguments, the program's name first.
OptionsResult optionsFromArguments(const std::vector<std::string>& arguments);

} // namespace orvex::korat
