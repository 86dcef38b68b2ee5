// Snapshots written from captures, and read again.

#include "scenarios/ScenarioTable.h"

#include "DecodeProgram.h"
#include "PcapFile.h"

#include "TextFormat.h"

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using Json = nlohmann::ordered_json;
using testing::HasSubstr;

class SnapshotDecodeTest : public DecodeProgram, public testing::Test {
protected:
    // The first seconds of a scenario as a capture.
    std::string drive(const korat::ScenarioEntry& entry) const
    {
        PcapFile capture;
        const auto scenario = entry.make({7, {}});
        for (auto item = scenario->next(); item.due < std::chrono::seconds(20); item = scenario->next())
            capture.add(item.message.bytes);
        return file("drive.pcap", capture.bytes());
    }
    static Json parsed(const Result& result)
    {
        EXPECT_EQ(result.status, 0) << result.errors;
        return Json::parse(result.output);
    }
    QString name(const char* file) const { return QString::fromStdString(path(file)); }
};

TEST_F(SnapshotDecodeTest, HoldsWhatTheCaptureHeldForEveryTechnology)
{
    for (const korat::ScenarioEntry& entry : korat::scenarioTable()) {
        const QString capture = QString::fromStdString(drive(entry));
        const QStringList options{"--technology", entry.technology, "--resources", ORVEX_RESOURCES,
            "--format", "json", "--refresh-every", "4"};
        const Json shown = parsed(decode(options
            + QStringList{"--snapshot", name("saved.orvex"), "--description", "öst & <west>", capture}));

        const Json document = parsed(decode(options + QStringList{name("saved.orvex")}));
        ASSERT_EQ(document["snapshots"].size(), 1U);
        const Json& saved = document["snapshots"][0];
        EXPECT_EQ(saved["description"], "öst & <west>");
        const std::size_t dlfEntries = entry.technology == std::string("IFX") ? 0 : 1;
        ASSERT_EQ(saved["entries"].size(), 5 + dlfEntries) << entry.technology;
        const Json& last = saved["entries"][4];
        EXPECT_THAT(last["description"].get<std::string>(), testing::StartsWith("Snapshot (2"));
        EXPECT_EQ(last["display"], shown) << entry.technology;
        // The five intervals alone, without what came before; of CDMA2000 and IFX that is everything.
        EXPECT_EQ(last["decoded"].size(), 3U) << entry.technology;
        if (dlfEntries == 0) {
            EXPECT_EQ(last["decoded"], shown);
        }
    }
}

TEST_F(SnapshotDecodeTest, TheBinaryLogDecodesToTheSameTree)
{
    const QString capture =
        QString::fromStdString(drive(*korat::findScenario("MRL_CDMA", ""))); // has no extra packets
    const QStringList options{"--technology", "MRL_CDMA", "--resources", ORVEX_RESOURCES};
    const Result shown = decode(options + QStringList{"--snapshot", name("saved.orvex"), capture});
    ASSERT_EQ(shown.status, 0) << shown.errors;
    const Result saved = decode(options + QStringList{"--dlf", name("saved.dlf"), name("saved.orvex")});
    EXPECT_THAT(saved.output, HasSubstr("Decoded anew"));
    const Result log = decode(options + QStringList{name("saved.dlf")});
    EXPECT_EQ(log.status, 0);
    EXPECT_EQ(log.errors, "");
    EXPECT_EQ(log.output, shown.output);

    const Result ifx = decode({"--technology", "IFX", "--snapshot", name("ifx.orvex"),
        QString::fromStdString(drive(*korat::findScenario("IFX", "")))});
    ASSERT_EQ(ifx.status, 0);
    const Result none = decode({"--dlf", name("none.dlf"), name("ifx.orvex")});
    EXPECT_EQ(none.status, 1);
    EXPECT_EQ(none.errors, "orvex-decode: " + path("ifx.orvex") + ": holds no binary log\n");
}

TEST_F(SnapshotDecodeTest, SaysInOneLineWhyASnapshotCannotBeRead)
{
    const Result result = decode({QString::fromStdString(file("broken.orvex", Bytes(10, '<')))});
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.output, "");
    EXPECT_THAT(result.errors, testing::StartsWith("orvex-decode: " + path("broken.orvex") + ": "));
    EXPECT_EQ(std::count(result.errors.begin(), result.errors.end(), '\n'), 1) << result.errors;
}

} // namespace
} // namespace orvex::test
