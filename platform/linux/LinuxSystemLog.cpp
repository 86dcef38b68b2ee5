#include "LinuxSystemLog.h"

#include "QueuedSystemLog.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <limits>
#include <string_view>

#include <syslog.h>

namespace orvex {

namespace {
void writeToStandardError(const QueuedSystemLog::Lines& lines)
{
    std::string text;
    for (const auto& line : lines)
        appendLogLine(text, line.priority, line.text);
    std::fwrite(text.data(), 1, text.size(), stderr);
    std::fflush(stderr);
}

void writeToSyslog(const QueuedSystemLog::Lines& lines)
{
    constexpr std::size_t kLongest = std::numeric_limits<int>::max();
    for (const auto& line : lines) {
        // Bits beyond those of a severity name a facility there, and are meant to.
        syslog(static_cast<int>(line.priority), "%.*s",
            static_cast<int>(std::min(line.text.size(), kLongest)), line.text.data());
    }
}
} // namespace

std::unique_ptr<SystemLog> makeLinuxSystemLog(const std::string& programName)
{
    const char* destination = std::getenv("ORVEX_LOG");
    if (destination && std::string_view(destination) == "stderr")
        return std::make_unique<QueuedSystemLog>(writeToStandardError);
    static std::string name; // the C library keeps the pointer
    name = programName;
    openlog(name.c_str(), LOG_PID, LOG_USER);
    return std::make_unique<QueuedSystemLog>(writeToSyslog);
}

} // namespace orvex
