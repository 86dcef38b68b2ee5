// docs/json.md shows what orvex-decode prints.

#include "DecodeProgram.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

namespace orvex::test {
namespace {

using Json = nlohmann::json;

TEST(JsonDocument, ShowsWhatTheDecoderPrints)
{
    std::ifstream file(ORVEX_TESTS "/../docs/json.md");
    std::string rest(std::istreambuf_iterator<char>(file), {});
    const auto next = [&rest](const std::string& begin, const char* end) {
        rest.erase(0, rest.find(begin) + begin.size());
        return rest.substr(0, rest.find(end));
    };
    const std::string command =
        "cd '" ORVEX_TESTS "/..' && '" ORVEX_DECODE "' " + next("    orvex-decode ", "\n");
    const Result result = run("/bin/sh", {"-c", QString::fromStdString(command)});
    EXPECT_EQ(Json::parse(next("```json\n", "```")), Json::parse(result.output)) << command;
    next("## A summary", "\n");
    const Result summary =
        run(ORVEX_DECODE, {"--format", "json", "--summary", ORVEX_CAPTURES "/MRL_LTE.pcap"});
    EXPECT_THAT(
        Json::parse(summary.output)["summary"], testing::Contains(Json::parse(next("```json\n", "```"))));
}

} // namespace
} // namespace orvex::test
