// Snapshots written from captures and read back.

#include "Captures.h"
#include "DecodeProgram.h"
#include "PacketText.h"
#include "PropertyListForms.h"

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using Json = nlohmann::ordered_json;

class SnapshotDecodeTest : public DecodeProgram, public testing::Test {
protected:
    static Json parsed(const Result& result)
    {
        EXPECT_EQ(result.status, 0) << result.errors;
        Json document = Json::parse(result.output);
        EXPECT_EQ(result.output, document.dump(2) + "\n");
        return document;
    }
};

TEST_F(SnapshotDecodeTest, KeepsTheDisplayOfEveryTechnology)
{
    for (const char* technology : kTechnologies) {
        SCOPED_TRACE(technology);
        const bool hasDLF = technology != std::string("IFX");
        const QStringList options{
            "--technology", technology, "--resources", ORVEX_RESOURCES, "--format", "json"};
        const Json shown = parsed(decode(options
            + QStringList{"--refresh-every", "4", "--snapshot", name("saved.orvex"), "--description",
                "öst & <west>", QString::fromStdString(capturePath(technology))}));

        const Json document = parsed(decode(options + QStringList{name("saved.orvex")}));
        ASSERT_EQ(document["snapshots"].size(), 1U);
        const Json& saved = document["snapshots"][0];
        EXPECT_EQ(saved["description"], "öst & <west>");
        ASSERT_EQ(saved["entries"].size(), hasDLF ? 6 : 5);
        const Json& last = saved["entries"][4];
        EXPECT_THAT(last["description"].get<std::string>(), testing::StartsWith("Snapshot (2"));
        EXPECT_EQ(last["display"], shown);
        // Only the five intervals of the history; for IFX they hold everything.
        EXPECT_EQ(last["decoded"].size(), 3U);
        EXPECT_TRUE(hasDLF || last["decoded"] == shown);

        const Result dlf = decode({"--dlf", name("saved.dlf"), name("saved.orvex")});
        EXPECT_EQ(dlf.status, hasDLF ? 0 : 1);
        EXPECT_EQ(
            dlf.errors, hasDLF ? "" : "orvex-decode: " + path("saved.orvex") + ": holds no binary log\n");
        if (technology == std::string("MRL_CDMA")) { // has no extra packets, which a DLF lacks
            EXPECT_EQ(parsed(decode(options + QStringList{name("saved.dlf")})), last["decoded"]);
        }
    }
}

TEST_F(SnapshotDecodeTest, SaysInOneLineWhyItCannotReadASnapshot)
{
    const Result result = decode({write("broken.orvex", Bytes(10, '<'))});
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.output, "");
    EXPECT_THAT(result.errors, testing::StartsWith("orvex-decode: " + path("broken.orvex") + ": "));
    EXPECT_EQ(std::count(result.errors.begin(), result.errors.end(), '\n'), 1) << result.errors;
}

TEST_F(SnapshotDecodeTest, NamesTheValueItCannotSave)
{
    Bytes key{0x5E}; // 14 characters
    const Bytes name14 = bytesOf("kSimFile_ICCID");
    key.insert(key.end(), name14.begin(), name14.end());
    const Bytes files = binaryList({{0xD1, 1, 2}, key, {0x33, 0x7F, 0xF0, 0, 0, 0, 0, 0, 0}});
    Bytes message = packetHeader(0xFF0000);
    message.insert(message.end(), files.begin(), files.end());
    const Result result = decode({"--technology", "MRL_LTE", "--resources", ORVEX_RESOURCES, "--snapshot",
        name("saved.orvex"), write("sim.pcap", PcapFile().add(message).bytes())});
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors,
        "orvex-decode: " + path("saved.orvex")
            + ": the value at /Data/0/Display/SIM Info/EF-ICCID is a date outside of the years 1 to 9999\n");
}

} // namespace
} // namespace orvex::test
