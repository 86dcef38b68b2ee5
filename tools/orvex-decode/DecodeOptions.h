#pragma once

#include "CommandLine.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

// What the user asked of the decoder.
struct DecodeOptions {
    enum class Format { tree, json };

    // The arguments as the program got them, its own name first.
    static DecodeOptions parse(int count, const char* const* arguments);

    std::optional<CommandLine::EarlyExit> earlyExit; // instead of decoding; nothing else is valid then

    std::string technology; // may be empty when all inputs are snapshots
    Format format = Format::tree;
    std::size_t refreshEvery = 0;          // messages; 0 asks for the display only at the end
    std::optional<std::string> resources;  // absent: the default directory
    std::optional<std::string> outputFile; // absent: standard output
    std::optional<std::string> logFile;
    std::optional<std::string> snapshotFile; // where to save the session; captures only
    std::string description;                 // the user's words in the snapshot
    std::optional<std::string> dlfFile;      // where the binary log of a snapshot goes
    std::vector<std::string> inputs;
    bool areSnapshots = false; // the inputs; else they are captures
};

} // namespace orvex
