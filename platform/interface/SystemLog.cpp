#include "SystemLog.h"

#include <cstdio>
#include <utility>

namespace orvex {

namespace {
ConsoleSink& theConsole()
{
    static ConsoleSink sink;
    return sink;
}
} // namespace

SystemLog* SystemLog::install(SystemLog* sink)
{
    return std::exchange(_installed, sink);
}

void installConsole(ConsoleSink sink)
{
    theConsole() = std::move(sink);
}

void writeConsoleLine(std::string_view line)
{
    if (theConsole())
        return theConsole()(line);
    std::fprintf(stdout, "%.*s\n", static_cast<int>(line.size()), line.data());
    std::fflush(stdout);
}

} // namespace orvex
