#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace orvex {

// What the user asked of the decoder.
struct DecodeOptions {
    enum class Action { decode, help, version, wrongUsage };
    enum class Format { tree, json };

    Action action = Action::decode;
    std::string error; // with wrongUsage: one line

    std::string technology; // may be empty when all captures are snapshots
    Format format = Format::tree;
    std::size_t refreshEvery = 0;          // messages; 0 asks for the display at the end alone
    std::optional<std::string> resources;  // a directory in place of the default one
    std::optional<std::string> outputFile; // absent: standard output
    std::optional<std::string> logFile;
    std::optional<std::string> snapshotFile; // of captures: what to save the session as
    std::string description;                 // the user's words in it
    std::optional<std::string> dlfFile;      // of a snapshot: where its binary log goes
    std::vector<std::string> captures;
    std::size_t jobs = 0;      // 0: one session takes all captures; else each has its own, so many at a time
    bool areSnapshots = false; // the captures, all of them

    // The arguments as the program got them, its own name first.
    static DecodeOptions parse(int count, char** arguments);
    static const char* usage();
};

} // namespace orvex
