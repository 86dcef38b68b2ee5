#pragma once

#include "Sampling.h"

#include <chrono>
#include <optional>
#include <string>

namespace orvex {

// The console's options.
struct ConsoleOptions {
    std::string path = "/"; // branch to show
    bool once = false;      // end after the first tree
    bool json = false;
    std::optional<std::chrono::milliseconds> timeout = {};
    std::optional<std::string> saveFile = {};     // snapshot written at the end
    std::optional<std::string> timelineFile = {}; // what the session shows, written as it goes
    Sampling sampling = {};                       // for that file
};

} // namespace orvex
