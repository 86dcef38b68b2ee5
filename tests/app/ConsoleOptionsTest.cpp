// What the options of the console do to a session.

#include "JsonView.h"
#include "LineView.h"
#include "OrvexConsole.h"

#include "SessionFixture.h"

#include "Snapshot.h"
#include "TemporaryFile.h"

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

struct ConsoleOptionsTest : testing::Test, SessionFixture {
    // Starts a session with the options, in which so many reports arrive, and lets 10 seconds pass.
    void run(const ConsoleOptions& options, int reports)
    {
        ended = 0;
        LineView view(output, false);
        OrvexConsole console(platform(), view, options);
        console.start([this] { ++ended; });
        runLoop.runPosted();
        for (int i = 0; i < reports; ++i)
            deliverNeighbors(0);
        runLoop.advance(10s);
        console.applicationWillTerminate();
        failure = console.failure();
    }

    RecordingOutput output;
    int ended = 0;
    std::string failure;
};

TEST_F(ConsoleOptionsTest, EndsWhenItIsToldTo)
{
    const char* const kBranch = "Updated 2023-11-15 at 00:13:20\n"
                                "Neighbor Measurements\n"
                                "  Version: 3\n"
                                "  E-ARFCN: 6300\n"
                                "  Qrxlevmin: -140 dBm\n";
    const struct {
        const char* name;
        ConsoleOptions options;
        bool hasService;
        int reports;
        int ended;
        std::string failure;
        std::string output;
    } cases[] = {
        {"once", {.path = "/Neighbor Measurements", .once = true}, true, 2, 1, "", kBranch},
        {"once, in time", {.path = "/Neighbor Measurements", .once = true, .timeout = 3s}, true, 1, 1, "",
            kBranch},
        {"once, without a message", {.once = true, .timeout = 3s}, true, 0, 1,
            "the session came up, but no message came in time.", ""},
        {"once, without the branch", {.path = "/N", .once = true, .timeout = 3s}, true, 1, 1,
            "nothing appeared at /N in time.", ""},
        {"once, without a session", {.once = true, .timeout = 3s}, false, 0, 1,
            "no session came up in time. 'orvex --diagnose' says why.", ""},
        {"a session without a message", {.timeout = 3s}, true, 0, 1, "", "Connecting...\n"},
        {"no session", {.timeout = 3s}, false, 0, 1,
            "no session came up in time. 'orvex --diagnose' says why.", "Connecting...\n"},
        {"no such branch", {.path = "/N"}, true, 1, 0, "",
            "Connecting...\n\nUpdated 2023-11-15 at 00:13:20\nNothing at /N\n"},
    };
    for (const auto& [name, options, hasService, reports, expectedEnds, expectedFailure, text] : cases) {
        telephony.serviceIsAbsent = !hasService;
        run(options, reports);
        EXPECT_EQ(ended, expectedEnds) << name;
        EXPECT_EQ(failure, expectedFailure) << name;
        EXPECT_EQ(output.take(), text) << name;
    }
}

TEST_F(ConsoleOptionsTest, SavesASnapshotAtTheEnd)
{
    const TemporaryFile file;
    run({.saveFile = file.path}, 1);
    EXPECT_EQ(failure, "");
    const auto saved = readSnapshot(file.path);
    ASSERT_TRUE(saved.snapshot) << saved.error;
    EXPECT_EQ(saved.snapshot->timestamp, "2023-11-14 22:13:20 +0000");
    EXPECT_EQ(saved.snapshot->data->size(), 2U); // a display and the DLF

    run({.saveFile = "/nowhere/file"}, 1);
    EXPECT_THAT(failure, testing::HasSubstr("/nowhere/file"));
    telephony.serviceIsAbsent = true;
    run({.saveFile = file.path}, 0);
    EXPECT_EQ(failure, "no snapshot was saved, as no session came up.");
}

TEST_F(ConsoleOptionsTest, JsonHasALineForEveryState)
{
    JsonView view(output);
    OrvexConsole console(platform(), view, {.path = "/Neighbor Measurements"});
    console.start();
    EXPECT_EQ(output.take(),
        R"({"schema":1,"status":"Connecting...","connected":false,"messages":0,"tree":null})"
        "\n");
    runLoop.runPosted();
    deliverNeighbors(0);
    refresh();
    EXPECT_EQ(output.take(),
        R"({"schema":1,"status":"Updated 2023-11-15 at 00:13:20","connected":true,"messages":1,"tree":)"
        R"({"name":"Neighbor Measurements","path":"/Neighbor Measurements","children":[)"
        R"({"name":"Version","path":"/Neighbor Measurements/Version","value":"3"},)"
        R"({"name":"E-ARFCN","path":"/Neighbor Measurements/E-ARFCN","value":"6300"},)"
        R"({"name":"Qrxlevmin","path":"/Neighbor Measurements/Qrxlevmin","value":"-140 dBm","number":-140.0,"unit":"dBm"}]}})"
        "\n");
}

} // namespace
} // namespace orvex::test
