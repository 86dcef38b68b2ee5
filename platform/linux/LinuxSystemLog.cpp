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
    for (const auto& [priority, text] : lines) {
        const int value = static_cast<int>(priority);
        const int length = static_cast<int>(std::min(text.size(), kLongest));
        // Bits beyond a severity would name a facility and leave severity 0, an emergency, which daemons
        // print on every terminal.
        if (value > LOG_PRIMASK)
            syslog(LOG_ERR, "<%d>%.*s", value, length, text.data());
        else
            syslog(value, "%.*s", length, text.data());
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
