#pragma once

#include "TextFormat.h"

#include <functional>
#include <string_view>

namespace orvex {

// The priorities of the system log, and one it does not know: the DLF writer has always logged its two
// failures with the value 16.
enum class Priority : int { error = 3, warning = 4, notice = 5, dlfFailure = 16 };

// Where log lines go. One sink serves the process; it must outlive every log call.
class SystemLog {
public:
    virtual ~SystemLog() = default;

    // The line as given; a trailing line break is part of the text.
    virtual void write(Priority priority, std::string_view line) = 0;
    // False when lines of this priority have no reader, so that none need be formatted.
    virtual bool wants(Priority) const { return true; }
    // Returns once everything written has reached its destination. Called before the process ends.
    virtual void flush() { }

    // Returns the previous sink. Without a sink, lines are dropped.
    static SystemLog* install(SystemLog* sink);
    static SystemLog* installed() { return _installed; }
    static bool isRead(Priority priority) { return _installed && _installed->wants(priority); }

private:
    static inline SystemLog* _installed = nullptr;
};

// Writes a line as it stands to the installed sink.
inline void systemLogText(Priority priority, std::string_view line)
{
    if (SystemLog::isRead(priority))
        SystemLog::installed()->write(priority, line);
}

// Writes a line in printf format to the installed sink. Formats nothing without a reader: sections log every
// packet.
template <typename... Arguments>
void systemLog(
    Priority priority, PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
{
    if (!SystemLog::isRead(priority))
        return;
    static thread_local std::string line; // keeps its storage
    line.clear();
    appendText(line, format, arguments...);
    SystemLog::installed()->write(priority, line);
}

// The console: developer lines on standard output. A program whose standard output is a document installs a
// sink that sends them elsewhere.
using ConsoleSink = std::function<void(std::string_view line)>;

// Lines go to standard output until a sink is installed; an empty sink restores that.
void installConsole(ConsoleSink sink);

// Writes one line; the line break is added.
void writeConsoleLine(std::string_view line);

} // namespace orvex
