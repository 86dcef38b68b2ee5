// Holds what the programs say at the command line against transcripts/*.txt:
//
//   ## NAME               begins a case, in an empty folder of its own
//   capture FILE PACKETS  makes a capture of packets as packetOfText() reads them, separated by ";", or of
//                         other messages: "bytes" and words of ByteText
//   $ COMMAND             is run by a shell that finds the programs; lines that begin with "> " continue it;
//                         "serve" is koratd in the background, once it listens, and $service its process
//   [STATUS]              is what it ends with, if not 0
//
// Other lines are what the command writes, on standard output and standard error; "…" stands for any text.
// JSON of orvex-decode must match the schema.

#include "PacketText.h"
#include "PcapWriter.h"
#include "Programs.h"
#include "orvex-decode/JsonSchema.h"

#include <gtest/gtest.h>

#include <fnmatch.h>
#include <fstream>
#include <regex>

namespace orvex::test {
namespace {

void makeCapture(const std::string& path, const std::string& packets)
{
    PcapWriter writer(path);
    std::istringstream stream(packets);
    for (std::string packet; std::getline(stream >> std::ws, packet, ';');) {
        std::chrono::microseconds time(1'700'000'000'654'321);
        if (packet[0] == '@') {
            time += std::chrono::milliseconds(std::stoll(packet.substr(1)));
            packet.erase(0, packet.find(' ') + 1);
        }
        const bool isBare = packet.starts_with("bytes ");
        writer.write(isBare ? bytesOfWords(packet.substr(6)) : packetOfText(packet), time);
    }
}

// What the shell's command line writes, with its status.
std::string outcomeOf(const ProgramFolder& folder, const std::string& command)
{
    const std::string line = "cd '" + folder.path("") + R"(' && exec 2>&1
        export PATH=$(dirname $0):$(dirname $1):$(dirname $2):$PATH CAPTURES=$3 RESOURCES=$4 BUILD=$5
        serve() {
            koratd "$@" 2> koratd.log & service=$!
            trap 'kill $service 2> /dev/null' EXIT
            until [ -S ports/org.orvex.Korat ]; do sleep .1; done
            sleep .2
        }
        )"
        + command;
    Program shell(folder, "/bin/sh",
        {"-c", QString::fromStdString(line), ORVEX_DECODE, KORATD_PATH, ORVEX_PATH, ORVEX_CAPTURES,
            ORVEX_RESOURCES, ORVEX_BUILD_DIRECTORY});
    const int status = shell.waitForEnd();
    const std::string output = shell.output();
    const bool isJson = output.starts_with('{') || output.starts_with("[\n");
    if (isJson && command.starts_with("orvex-decode")) {
        EXPECT_EQ(schemaFaults(output), "");
    }
    return std::regex_replace(output, std::regex("\n+"), "\n") + (status == 0 ? "" : text("[%d]\n", status));
}

bool matches(const std::string& outcome, const std::string& expected)
{
    const std::string literal = std::regex_replace(expected, std::regex(R"([*?[\\])"), R"(\$&)");
    const std::string pattern = std::regex_replace(literal, std::regex("…"), "*");
    return fnmatch(pattern.c_str(), outcome.c_str(), 0) == 0;
}

struct Step {
    std::string line; // the first one, without an end
    std::string outcome;
};

std::vector<Step> stepsOf(const std::string& transcript)
{
    std::ifstream file(ORVEX_TESTS "/tools/transcripts/" + transcript + ".txt");
    std::vector<Step> steps;
    for (std::string line; std::getline(file, line);) {
        if (line.starts_with("## ") || line.starts_with("capture ") || line.starts_with("$ "))
            steps.push_back({line, ""});
        else if (line.starts_with("> "))
            steps.back().line += '\n' + line.substr(2);
        else if (!line.empty() && !line.starts_with("# "))
            steps.back().outcome += line + '\n';
    }
    return steps;
}

class TranscriptsTest : public testing::TestWithParam<const char*> { };

TEST_P(TranscriptsTest, AreWhatTheProgramsSay)
{
    const std::vector<Step> steps = stepsOf(GetParam());
    EXPECT_FALSE(steps.empty());
    std::unique_ptr<ProgramFolder> folder;
    for (const auto& [line, expected] : steps) {
        if (line.starts_with("## ")) {
            folder = std::make_unique<ProgramFolder>();
        } else if (line.starts_with("$ ")) {
            const std::string outcome = outcomeOf(*folder, line.substr(2));
            EXPECT_TRUE(matches(outcome, expected)) << line << '\n' << outcome;
        } else {
            const auto blank = line.find(' ', 8);
            makeCapture(folder->path(line.substr(8, blank - 8).c_str()),
                blank == std::string::npos ? "" : line.substr(blank + 1));
        }
    }
}

INSTANTIATE_TEST_SUITE_P(, TranscriptsTest,
    testing::Values("console", "decode", "programs", "sessions", "timeline"),
    [](const auto& each) { return std::string(each.param); });

} // namespace
} // namespace orvex::test
