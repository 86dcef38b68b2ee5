#pragma once

#include "CommandLine.h"
#include "Sampling.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

// The name of standard input among the inputs.
inline constexpr const char* kStandardStream = "-";

// True for the name of an SQLite database.
bool isDatabaseFile(const std::string& path);

// What the user asked of the decoder.
struct DecodeOptions {
    enum class Task { decode, sample, summarize, showSnapshots, compareSnapshots, mergeDatabases };
    enum class Format { tree, json };

    // The arguments as the program got them, its own name first.
    static DecodeOptions parse(int count, const char* const* arguments);

    std::optional<CommandLine::EarlyExit> earlyExit; // instead of decoding; nothing else is valid then

    Task task = Task::decode;
    std::vector<std::string> inputs; // captures, or what the task names
    std::string technology;          // empty to guess that of captures, and not to decode snapshots
    Format format = Format::tree;
    std::string path = "/";               // of the part of each display to print
    bool isQuiet = false;                 // no notes, no progress
    std::size_t refreshEvery = 0;         // messages; 0 asks for the display only at the end
    Sampling sampling;                    // of the display over time
    std::optional<std::string> resources; // absent: the default directory

    // Where outputs go; "-" has become /dev/stdout.
    std::optional<std::string> outputFile; // absent: standard output
    std::optional<std::string> logFile;
    std::optional<std::string> snapshotFile; // where to save the session; captures only
    std::string description;                 // the user's words in the snapshot
    std::optional<std::string> dlfFile;      // where the binary log of a snapshot goes
    std::optional<std::string> timelineFile;
    std::optional<std::string> reportFile;
};

} // namespace orvex
