#pragma once

#include <chrono>
#include <optional>
#include <string>

namespace orvex {

// What the user asked of the console.
struct ConsoleOptions {
    std::string path = "/"; // of the branch to show
    bool once = false;      // end after the first tree
    bool json = false;
    std::optional<std::chrono::milliseconds> timeout = {};
    std::optional<std::string> saveFile = {}; // for a snapshot at the end
};

} // namespace orvex
