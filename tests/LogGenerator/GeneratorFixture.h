#pragma once

#include "FixedClock.h"
#include "FixedResources.h"
#include "RecordingLog.h"
#include "Shown.h"

#include "LogGenerator.h"

#include <gtest/gtest.h>

namespace orvex::test {

using Lines = std::vector<std::string>;

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
