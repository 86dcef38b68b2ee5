#pragma once

#include "DecodeOptions.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <ostream>
#include <string>
#include <string_view>
#include <vector>

namespace orvex {

// Prints a line on standard error. Returns false.
bool printError(const std::string& message);
// Prints a line on standard error that is no error, unless the user wants none.
void printNote(const std::string& message, const DecodeOptions& options);
// Replaces the file. Returns false, after an error line, when that fails.
bool writeFile(const std::string& path, std::string_view content);
// Writes the document where the options say. Returns false, after an error line, when that fails.
bool printDocument(const std::function<void(std::ostream&)>& write, const DecodeOptions& options);

// Cuts long texts for a terminal, but not for a file or another program.
std::size_t longestText(const DecodeOptions& options);

// Shows the progress of a large job on a terminal.
class Progress {
public:
    // The inputs' sizes decide whether the job is large. Streams have none and show no progress.
    explicit Progress(const DecodeOptions& options);
    ~Progress();
    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    // Counts a message of this length.
    void advance(std::size_t messageLength);

private:
    void show() const;

    std::uintmax_t _totalBytes = 0;
    std::uintmax_t _bytes = 0;
    std::uintmax_t _nextShown = 0;
    bool _isShown = false;
};

} // namespace orvex
