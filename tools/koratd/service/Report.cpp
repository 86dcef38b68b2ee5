#include "Report.h"

#include "TextFormat.h"

#include <cstdio>

namespace orvex::korat {

void report(const char* format, ...)
{
    std::string text;
    std::va_list arguments; // NOLINT(cppcoreguidelines-init-variables): va_start initialises it
    va_start(arguments, format);
    formatInto(text, format, arguments);
    va_end(arguments);
    const std::string line = "koratd: " + text + '\n';
    // One call, so that lines of several processes on one terminal stay whole.
    std::fwrite(line.data(), 1, line.size(), stderr);
}

} // namespace orvex::korat
