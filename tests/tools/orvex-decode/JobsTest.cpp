// Several captures, each in a session of its own.

#include "scenarios/ScenarioTable.h"

#include "DecodeProgram.h"
#include "PacketText.h"

#include <QRegularExpression>

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using Json = nlohmann::ordered_json;
using testing::HasSubstr;

class JobsTest : public DecodeProgram, public testing::Test {
protected:
    JobsTest()
    {
        // The first is by far the longest, so that the others are done before it.
        for (const std::size_t messages : {5'000U, 1U, 200U, 20U, 1'000U}) {
            PcapFile capture;
            const auto scenario = korat::findScenario("MRL_LTE", "")->make({messages, {}});
            for (std::size_t i = 0; i < messages; ++i)
                capture.add(scenario->next().message.bytes);
            captures << write(std::to_string(messages).c_str(), capture.bytes());
        }
    }

    Result decodeAll(const QStringList& which, const QStringList& options = {}) const
    {
        return decode(
            QStringList{"--technology", "MRL_LTE", "--resources", ORVEX_RESOURCES} + options + which);
    }
    QString logWithoutAddresses() const
    {
        return QString::fromStdString(contentsOf(path("log"))).remove(QRegularExpression("0x[0-9a-f]+"));
    }

    QStringList captures;
};

TEST_F(JobsTest, WritesWhatEachCaptureAloneGives)
{
    std::string trees;
    QString log;
    Json displays = Json::array();
    for (const QString& capture : captures) {
        trees += decodeAll({capture}, {"--log", name("log")}).output;
        log += logWithoutAddresses();
        displays.push_back({{"capture", capture.toStdString()},
            {"display", Json::parse(decodeAll({capture}, {"--format", "json"}).output)}});
    }
    for (const char* jobs : {"1", "3", "50"}) {
        const Result result = decodeAll(captures, {"--jobs", jobs, "--log", name("log")});
        EXPECT_EQ(result.status, 0) << result.errors;
        EXPECT_EQ(result.output, trees) << jobs;
        EXPECT_TRUE(logWithoutAddresses() == log) << jobs;
        const Result json = decodeAll(captures, {"--jobs", jobs, "--format", "json"});
        EXPECT_EQ(json.output, (Json{{"captures", displays}}).dump(2) + "\n") << jobs;
    }
}

TEST_F(JobsTest, OneThatFailsLeavesTheOthersAlone)
{
    const QString missing = name("missing.pcap");
    const QString fatal =
        write("fatal.pcap", PcapFile().add(packet(0xFF0000, {'x'})).bytes()); // ends its process by design
    const Result expected = decodeAll({captures[1], captures[2]}, {"--jobs", "2"});
    ASSERT_EQ(expected.status, 0);
    const Result result =
        decodeAll({captures[1], missing, fatal, captures[2]}, {"--jobs", "2", "--log", name("log")});
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.output, expected.output);
    EXPECT_EQ(result.errors,
        "orvex-decode: " + path("missing.pcap") + ": No such file or directory\norvex-decode: "
            + path("fatal.pcap") + ": decoding ended by signal 6 (Aborted)\n");
    EXPECT_THAT(contentsOf(path("log")), HasSubstr("UnknownDataException"));
    EXPECT_EQ(decodeAll({missing}, {"--jobs", "2", "--format", "json"}).output, "");
}

} // namespace
} // namespace orvex::test
