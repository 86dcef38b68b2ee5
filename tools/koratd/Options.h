#pragma once

#include "scenarios/ScenarioTable.h"
#include "service/Faults.h"

#include <QStringList>

#include <optional>
#include <string>

namespace orvex::korat {

// What the command line asks for.
struct Options {
    std::string technology;
    const ScenarioEntry* scenario = nullptr; // what is played; none: the capture
    std::optional<std::string> replay;       // file of the capture to play
    bool isLooped = false;                   // the capture is played again and again
    std::optional<std::string> record;       // file of the capture to write of what is streamed
    std::optional<double> rate;         // messages per second; none: the scenario's or capture's own pace
    std::optional<std::uint64_t> count; // messages to a client, after which its stream rests
    std::uint64_t seed = 1;
    Faults faults;
};

struct OptionsResult {
    std::optional<Options> options;
    std::string text;  // without options: what to print instead, help or version...
    std::string error; // ... or what is wrong; the text is the usage then, unless only a file is at fault
};

// The arguments as argumentTexts() gives them, the name of the program first.
OptionsResult optionsFromArguments(const QStringList& arguments);

} // namespace orvex::korat
