#include "Reporting.h"

#include "OutputFile.h"
#include "VisibleText.h"

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <iostream>
#include <unistd.h>

namespace orvex {

namespace {

bool writeFile(const std::string& path, const std::function<void(std::ostream&)>& write)
{
    auto [file, error] = openOutputFile(path);
    if (file) {
        FileBuffer buffer(*file);
        std::ostream stream(&buffer);
        write(stream);
        stream.flush();
        error = closeOutputFile(std::move(file));
    }
    return error.empty() || printError(path + ": " + error);
}

constexpr std::uintmax_t kLargeJob = std::uintmax_t{64} << 20;
constexpr std::uintmax_t kStep = std::uintmax_t{8} << 20;
constexpr std::size_t kPcapRecordHeader = 16;

std::uintmax_t sizeOf(const std::string& capture)
{
    std::error_code unreadable;
    const std::uintmax_t size = std::filesystem::file_size(capture, unreadable);
    return unreadable ? 0 : size;
}

} // namespace

bool printError(const std::string& message)
{
    std::cerr << "orvex-decode: " << visibleText(message) << '\n';
    return false;
}

void printNote(const std::string& message, const DecodeOptions& options)
{
    if (!options.isQuiet)
        printError(message);
}

bool writeFile(const std::string& path, std::string_view content)
{
    return writeFile(path, [content](std::ostream& stream) { stream << content; });
}

bool printDocument(const std::function<void(std::ostream&)>& write, const DecodeOptions& options)
{
    if (options.outputFile)
        return writeFile(*options.outputFile, write);
    write(std::cout);
    std::cout.flush();
    return std::cout ? true : printError("standard output: could not be written");
}

std::size_t longestText(const DecodeOptions& options)
{
    return !options.outputFile && isatty(STDOUT_FILENO) == 1 ? kLongestVisibleText : std::string::npos;
}

Progress::Progress(const DecodeOptions& options)
{
    for (const std::string& capture : options.inputs)
        _totalBytes += sizeOf(capture);
    _isShown = _totalBytes >= kLargeJob && !options.isQuiet && isatty(STDERR_FILENO) == 1;
}

Progress::~Progress()
{
    if (_isShown)
        std::fputs("\r\x1b[K", stderr);
}

void Progress::advance(std::size_t messageLength)
{
    _bytes += messageLength + kPcapRecordHeader;
    if (!_isShown || _bytes < _nextShown)
        return;
    _nextShown = _bytes + kStep;
    show();
}

void Progress::show() const
{
    if (_bytes > _totalBytes) { // compressed
        std::fprintf(stderr, "\rorvex-decode: %ju MiB        ", _bytes >> 20);
        return;
    }
    const double part = 100.0 * static_cast<double>(_bytes) / static_cast<double>(_totalBytes);
    std::fprintf(stderr, "\rorvex-decode: %.0f %% of %ju MiB", part, _totalBytes >> 20);
}

} // namespace orvex
