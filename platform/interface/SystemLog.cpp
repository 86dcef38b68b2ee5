#include "SystemLog.h"

#include "TextFormat.h"

#include <utility>

namespace orvex {

SystemLog* SystemLog::install(SystemLog* sink)
{
    return std::exchange(_installed, sink);
}

void writeLogLine(Priority priority, const char* format, ...)
{
    std::string line;
    std::va_list arguments; // NOLINT(cppcoreguidelines-init-variables): va_start initialises it
    va_start(arguments, format);
    formatInto(line, format, arguments);
    va_end(arguments);
    SystemLog::installed()->write(priority, line);
}

} // namespace orvex
