#pragma once

#include "Faults.h"

#include <QStringList>

#include <string>

namespace orvex::korat {

// What the command line asks for.
struct Options {
    std::string technology;
    std::string capture;                // file that is played
    bool once = false;                  // not again and again
    std::optional<std::string> record;  // pcap file to write of what is streamed
    std::optional<double> rate;         // messages per second; none: the capture's own pace
    std::optional<std::uint64_t> count; // messages to a client, after which its stream rests
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
