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
            captures << QString::fromStdString(
                file((std::to_string(messages) + ".pcap").c_str(), capture.bytes()));
        }
    }

    Result decodeAll(const QStringList& which, const QStringList& options = {}) const
    {
        return decode(
            QStringList{"--technology", "MRL_LTE", "--resources", ORVEX_RESOURCES} + options + which);
    }
    static QString withoutAddresses(const std::string& log)
    {
        static const QRegularExpression kAddress("0x[0-9a-f]+");
        return QString::fromStdString(log).remove(kAddress);
    }
    QStringList withLog(const char* name) const { return {"--log", QString::fromStdString(path(name))}; }

    QStringList captures;
};

TEST_F(JobsTest, WritesWhatEachCaptureAloneGives)
{
    std::string trees;
    std::string log;
    Json displays = Json::array();
    for (const QString& capture : captures) {
        trees += decodeAll({capture}, withLog("one.log")).output;
        log += contentsOf(path("one.log"));
        displays.push_back({{"capture", capture.toStdString()},
            {"display", Json::parse(decodeAll({capture}, {"--format", "json"}).output)}});
    }
    for (const char* jobs : {"1", "3", "50"}) {
        const Result result = decodeAll(captures, QStringList{"--jobs", jobs} + withLog("all.log"));
        EXPECT_EQ(result.status, 0) << result.errors;
        EXPECT_EQ(result.errors, "");
        EXPECT_EQ(result.output, trees) << jobs;
        EXPECT_TRUE(withoutAddresses(contentsOf(path("all.log"))) == withoutAddresses(log)) << jobs;
        const Result json = decodeAll(captures, {"--jobs", jobs, "--format", "json"});
        EXPECT_EQ(Json::parse(json.output), (Json{{"captures", displays}})) << jobs;
    }
}

TEST_F(JobsTest, OneThatFailsLeavesTheOthersAlone)
{
    const std::string missing = path("missing.pcap");
    const std::string fatal =
        file("fatal.pcap", PcapFile().add(packet(0xFF0000, {'x'})).bytes()); // ends its process by design
    const QStringList whole = {captures[1], captures[2]};
    const QStringList all = {
        captures[1], QString::fromStdString(missing), QString::fromStdString(fatal), captures[2]};
    const Result expected = decodeAll(whole, {"--jobs", "2"});
    ASSERT_EQ(expected.status, 0);

    const Result result = decodeAll(all, QStringList{"--jobs", "2"} + withLog("log"));
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.output, expected.output);
    EXPECT_EQ(result.errors,
        "orvex-decode: " + missing + ": No such file or directory\n" + "orvex-decode: " + fatal
            + ": decoding ended by signal 6 (Aborted)\n");
    EXPECT_THAT(contentsOf(path("log")), HasSubstr("UnknownDataException"));

    const Result none = decodeAll({QString::fromStdString(missing)}, {"--jobs", "2", "--format", "json"});
    EXPECT_EQ(none.status, 1);
    EXPECT_EQ(none.output, "");
}

} // namespace
} // namespace orvex::test
