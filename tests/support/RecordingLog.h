#pragma once

#include "SystemLog.h"

#include "TextFormat.h"

#include <string>
#include <utility>
#include <vector>

namespace orvex::test {

// Keeps every log line as "<PRIORITY>TEXT" while it lives.
class RecordingLog final : public SystemLog {
public:
    RecordingLog()
        : _previous(SystemLog::install(this))
    {
    }
    ~RecordingLog() override { SystemLog::install(_previous); }
    RecordingLog(const RecordingLog&) = delete;
    RecordingLog& operator=(const RecordingLog&) = delete;

    void write(Priority priority, std::string_view line) override
    {
        lines.push_back(text("<%d>", static_cast<int>(priority)) + std::string(line));
    }

    // Returns the lines since the last call.
    std::vector<std::string> take() { return std::exchange(lines, {}); }

    std::vector<std::string> lines;

private:
    SystemLog* _previous;
};

} // namespace orvex::test
