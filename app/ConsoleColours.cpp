#include "ConsoleColours.h"

#include "VisibleText.h"

#include <cstdlib>
#include <string_view>
#include <unistd.h>

namespace orvex {

namespace {

constexpr const char* kBold = "\x1b[1m";
constexpr const char* kReversed = "\x1b[7m";
constexpr const char* kGreen = "\x1b[32m";
constexpr const char* kYellow = "\x1b[33m";
constexpr const char* kCyan = "\x1b[36m";
constexpr const char* kNormal = "\x1b[0m";

std::string in(const char* look, const std::string& text)
{
    return look + text + kNormal;
}

std::string_view variable(const char* name)
{
    const char* const value = std::getenv(name);
    return value ? value : "";
}

} // namespace

bool standardOutputTakesColours()
{
    return variable("NO_COLOR").empty() && variable("TERM") != "dumb" && ::isatty(STDOUT_FILENO);
}

std::string colouredStatus(const std::string& status, bool isConnected)
{
    return in(isConnected ? kGreen : kYellow, status);
}

std::string colouredLine(const std::string& line, std::size_t nameEnd)
{
    // Behind the name of a branch there is nothing, or what fitting it into a column has added.
    if (nameEnd >= line.size() || line[nameEnd] != ':')
        return in(kBold, line);
    const std::size_t valueStart = nameEnd + 1;
    return line.substr(0, valueStart) + in(kCyan, line.substr(valueStart));
}

std::string highlightedLine(const std::string& line)
{
    return in(kReversed, line);
}

std::string nothingAt(const std::string& path)
{
    return "Nothing at " + visibleText(path);
}

} // namespace orvex
