#pragma once

#include "Faults.h"

#include "CommandLine.h"

#include <string>

namespace orvex::korat {

// What the user asked of koratd.
struct Options {
    // The arguments as the program got them, its own name first.
    static Options parse(int count, const char* const* arguments);

    std::optional<CommandLine::EarlyExit> earlyExit; // instead of serving; nothing else is valid then

    enum class From { capture, modemManager };
    From from = From::capture;
    std::optional<std::string> technology; // none: that of the modem's serving cell
    bool identities = false;               // of modem and subscriber are shown
    bool measurements = false;             // of LTE cells are sent
    std::string capture;                   // file to play
    bool once = false;                     // else again and again
    std::optional<std::string> record;     // pcap file for what is streamed
    std::optional<double> rate;            // messages per second; absent: the capture's own pace
    std::optional<std::uint64_t> count;    // messages per client
    Faults faults;
};

} // namespace orvex::korat
