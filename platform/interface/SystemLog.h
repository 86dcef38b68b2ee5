#pragma once

#include "TextFormat.h"

#include <string_view>

namespace orvex {

// Priorities as the system log knows them, and one it does not: the two failures of the DLF writer have
// always been logged with the value 16.
enum class Priority : int { error = 3, warning = 4, notice = 5, dlfFailure = 16 };

// Where log lines go. One sink serves the process; it must outlive every log call.
class SystemLog {
public:
    virtual ~SystemLog() = default;

    // The line as given; a trailing line break is part of the text.
    virtual void write(Priority priority, std::string_view line) = 0;
    // False when nobody would read a line of this priority, so that it need not be made.
    virtual bool wants(Priority) const { return true; }
    // Returns when all that was written has reached its destination. Called before the process ends.
    virtual void flush() { }

    // Lines are dropped while no sink is installed. Returns the previous sink.
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

// Writes one line, made by a printf format, to the installed sink. A line that nobody would read is not made:
// sections tell of every packet.
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

} // namespace orvex
