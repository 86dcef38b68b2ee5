// What orvex-decode makes of large inputs; transcripts/ has the rest.

#include "Captures.h"
#include "JsonSchema.h"
#include "PcapWriter.h"
#include "Programs.h"
#include "PropertyListForms.h"

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>

namespace orvex::test {
namespace {

using Json = nlohmann::ordered_json;
using testing::StartsWith;

// The JSON that is printed for a technology's input; it matches the schema.
Json decoded(const std::string& technology, const QStringList& arguments)
{
    const Result result = run(ORVEX_DECODE,
        QStringList{"--format", "json", "--technology", QString::fromStdString(technology)} + arguments);
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_EQ(schemaFaults(result.output), "");
    return Json::parse(result.output);
}

TEST(Decode, PrintsDeepTreesCompactAndWithoutPaths)
{
    const ProgramFolder folder;
    for (const auto& [levels, hasPaths] : {std::pair(31, true), {32, false}, {250, false}}) {
        std::string list = "<dict><key>c</key><string>y</string><key>d</key><string/></dict>";
        for (int i = 1; i < levels; ++i)
            list = "<dict><key>b\xC3\xA4</key><string>x</string><key>a</key>" + list + "</dict>";
        PcapWriter(folder.path("deep")).write(bytesOf("<plist>" + list + "</plist>"), {});
        const Result result =
            run(ORVEX_DECODE, {"--technology", "IFX", "--format", "json", folder.name("deep")});
        ASSERT_EQ(result.status, 0) << result.errors;
        const auto tree = Json::parse(result.output)["tree"].dump();
        EXPECT_EQ(result.output.find(tree) == std::string::npos, hasPaths) << levels;
        EXPECT_EQ(result.output.find("path") != std::string::npos, hasPaths) << levels;
    }
}

TEST(Decode, SnapshotsKeepTheDisplayOfEveryTechnology)
{
    const ProgramFolder folder;
    const QString saved = folder.name("saved.orvex");
    for (const std::string technology : kTechnologies) {
        SCOPED_TRACE(technology);
        const bool hasDLF = technology != "IFX";
        const Json shown = decoded(technology,
            {"--refresh-every", "4", "--snapshot", saved, "--description", "öst & <west>",
                QString::fromStdString(capturePath(technology))})["tree"];
        const Json snapshot = decoded(technology, {saved});
        EXPECT_EQ(snapshot["description"], "öst & <west>");
        ASSERT_EQ(snapshot["entries"].size(), hasDLF ? 6 : 5);
        const Json& last = snapshot["entries"][4];
        EXPECT_THAT(last["description"].get<std::string>(), StartsWith("Snapshot (2"));
        EXPECT_EQ(last["display"], shown);
        // Only the five intervals of the history; for IFX they hold everything.
        EXPECT_EQ(last["decoded"].size(), 3U);
        EXPECT_TRUE(hasDLF || last["decoded"] == shown);

        const Result dlf = run(ORVEX_DECODE, {"--dlf", folder.name("saved.dlf"), saved});
        EXPECT_EQ(dlf.status, hasDLF ? 0 : 1);
        EXPECT_EQ(
            dlf.errors, hasDLF ? "" : "orvex-decode: " + saved.toStdString() + ": holds no binary log\n");
        if (technology == "MRL_CDMA") { // has no extra packets, which a DLF lacks
            EXPECT_EQ(decoded(technology, {folder.name("saved.dlf")})["tree"], last["decoded"]);
        }
    }
}

} // namespace
} // namespace orvex::test
