#pragma once

#include "FixedClock.h"
#include "FixedResources.h"
#include "RecordingLog.h"
#include "Shown.h"

#include "LogGenerator.h"

#include <gtest/gtest.h>

#include <numeric>

namespace orvex::test {

using Lines = std::vector<std::string>;

inline std::string joined(const Lines& lines)
{
    return std::accumulate(lines.begin(), lines.end(), std::string());
}

// Takes what is written to the console, into those lines as "<console>TEXT" if there are any. After its end
// the console stays quiet.
class ConsoleLines {
public:
    explicit ConsoleLines(Lines* lines = nullptr)
    {
        installConsole([lines](std::string_view line) {
            if (lines)
                lines->push_back("<console>" + std::string(line));
        });
    }
    ~ConsoleLines()
    {
        installConsole([](std::string_view) {});
    }
    ConsoleLines(const ConsoleLines&) = delete;
    ConsoleLines& operator=(const ConsoleLines&) = delete;
};

// What a generator needs, and the state that generators share.
class GeneratorFixture : public testing::Test {
public:
    GeneratorEnvironment environment() const { return {resources, clock, {}}; }

    // The display as text; "(null)" before there is one.
    std::string display() const
    {
        const auto rows = state["Display"].dictionary();
        return rows ? shown(*rows) : shown(state["Display"]);
    }
    void clearState()
    {
        for (const char* key :
            {"Template", "TemplateName", "Display", "DisplayState", "ExtraInfo", "History"})
            state.remove(key);
    }
    const Bytes& keptMessages() const { return *state["DisplayState"].data(); }

    FixedResources resources;
    FixedClock clock;
    Dictionary state;
};

} // namespace orvex::test
