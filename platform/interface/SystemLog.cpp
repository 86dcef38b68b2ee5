#include "SystemLog.h"

#include "TextFormat.h"

#include <utility>

namespace orvex {

namespace {
SystemLog* theSink = nullptr;
} // namespace

SystemLog* SystemLog::install(SystemLog* sink)
{
    return std::exchange(theSink, sink);
}

SystemLog* SystemLog::installed()
{
    return theSink;
}

void systemLog(Priority priority, const char* format, ...)
{
    if (!theSink || !theSink->wants(priority))
        return;
    std::string line;
    std::va_list arguments; // NOLINT(cppcoreguidelines-init-variables): va_start initialises it
    va_start(arguments, format);
    formatInto(line, format, arguments);
    va_end(arguments);
    theSink->write(priority, line);
}

} // namespace orvex
