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

    std::string technology;
    Format format = Format::tree;
    std::size_t refreshEvery = 0;          // messages; 0 asks for the display at the end alone
    std::optional<std::string> resources;  // a directory in place of the default one
    std::optional<std::string> outputFile; // absent: standard output
    std::optional<std::string> logFile;
    std::vector<std::string> captures;

    // The arguments as the program got them, its own name first.
    static DecodeOptions parse(int count, char** arguments);
    static const char* usage();
};

} // namespace orvex
