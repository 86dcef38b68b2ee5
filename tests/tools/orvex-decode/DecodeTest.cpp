// orvex-decode as a program.

#include "Captures.h"
#include "DecodeProgram.h"
#include "PacketText.h"
#include "PropertyListForms.h"

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>

namespace orvex::test {
namespace {

using Json = nlohmann::ordered_json;
using testing::HasSubstr;
using testing::StartsWith;

// An antenna packet that shows this number.
Bytes antennas(std::uint8_t count)
{
    return packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, count, 8});
}

class DecodeTest : public DecodeProgram {
protected:
    static Json parsed(const Result& result)
    {
        EXPECT_EQ(result.status, 0) << result.errors;
        Json document = Json::parse(result.output);
        EXPECT_EQ(result.output, document.dump(2) + "\n");
        return document;
    }

    const QStringList lte{"--technology", "MRL_LTE", "--resources", ORVEX_RESOURCES};
};

TEST_F(DecodeTest, PrintsTheTreeOfTheCaptures)
{
    const QStringList captures{capture("1", {antennas(1)}), capture("2", {antennas(4)})};
    const Result tree = decode(lte + captures);
    EXPECT_EQ(tree.status, 0);
    EXPECT_EQ(tree.errors, "");
    EXPECT_THAT(tree.output, StartsWith("Orvex\n  Serving Cell Info\n"));
    EXPECT_THAT(tree.output, HasSubstr("    Num Tx Antennas: 4\n"));

    const QStringList json{"--format", "json"};
    const Json root = parsed(decode(lte + json + captures))[1]["tree"];
    EXPECT_EQ(root["name"], "Orvex");
    EXPECT_EQ(root["path"], "/");
    ASSERT_GT(root["children"].size(), 3U);
    EXPECT_EQ(root["children"][0]["children"].back().dump(),
        R"({"name":"Num Tx Antennas","path":"/Serving Cell Info/Num Tx Antennas","value":"4"})");
    EXPECT_EQ(root["children"][3]["children"], Json::array());

    const QStringList nothing = lte + QStringList{capture("none", {})};
    EXPECT_EQ(decode(nothing).output, "Orvex: (unknown)\n");
    EXPECT_EQ(parsed(decode(json + nothing))["tree"],
        (Json{{"name", "Orvex"}, {"path", "/"}, {"value", "(unknown)"}}));
}

TEST_F(DecodeTest, PrintsDeepTreesCompactAndWithoutPaths)
{
    for (const auto& [levels, hasPaths] : {std::pair(31, true), {32, false}, {250, false}}) {
        std::string list = "<dict><key>c</key><string>y</string><key>d</key><string/></dict>";
        for (int i = 1; i < levels; ++i)
            list = "<dict><key>b\xC3\xA4</key><string>x</string><key>a</key>" + list + "</dict>";
        const Result result = decode({"--technology", "IFX", "--format", "json",
            capture("deep", {bytesOf("<plist>" + list + "</plist>")})});
        ASSERT_EQ(result.status, 0) << result.errors;
        const auto tree = Json::parse(result.output)["tree"].dump();
        EXPECT_EQ(result.output.find(tree) == std::string::npos, hasPaths) << levels;
        EXPECT_EQ(result.output.find("path") != std::string::npos, hasPaths) << levels;
    }
}

TEST_F(DecodeTest, SaysInOneLineWhatItCannotReadOrWrite)
{
    const QString good = capture("good", {antennas(4)});
    for (const char* cut : {"cut", "cut later"}) {
        capture(cut, std::vector<Bytes>(cut == std::string("cut") ? 1 : 2, antennas(4)));
        std::filesystem::resize_file(path(cut), std::filesystem::file_size(path(cut)) - 1);
    }
    std::ofstream(path("broken.orvex")) << "<<<";
    const struct {
        QStringList arguments;
        int status;
        bool isShown;
        std::string error;
    } cases[] = {
        {{name("cut")}, 1, false, "cut: truncated"},
        {{name("cut later")}, 1, true, "(after 1 whole messages)\n"},
        {{good, "/no/such/capture"}, 1, true, "orvex-decode: /no/such/capture: No such file or directory\n"},
        {{good, "--output", "/dev/full"}, 1, false, "/dev/full: No space left on device"},
        {{good, "--log", "/dev/full"}, 1, true, "/dev/full: No space left on device"},
        {{good, "--snapshot", "/dev/full"}, 1, true, "/dev/full: No space left on device"},
        {{good, "--output", "/no/such/folder/file"}, 1, false, "/no/such/folder/file: No such file or dir"},
        {{name("broken.orvex")}, 1, false, "orvex-decode: " + path("broken.orvex") + ": "},
    };
    for (const auto& [arguments, status, isShown, error] : cases) {
        const bool isSnapshot = arguments[0].endsWith(".orvex");
        const Result result = decode(isSnapshot ? arguments : lte + arguments);
        EXPECT_EQ(result.status, status) << error;
        EXPECT_THAT(result.errors, HasSubstr(error));
        EXPECT_EQ(std::ranges::count(result.errors, '\n'), 1) << result.errors;
        EXPECT_EQ(result.output.find("Num Tx Antennas: 4\n") != std::string::npos, isShown) << error;
    }
}

TEST_F(DecodeTest, RefusesToWriteAFileItReadsOrWritesAlready)
{
    namespace fs = std::filesystem;
    const QString input = capture("x.pcap", {antennas(4)});
    const std::string before = contentsOf("x.pcap");
    fs::create_symlink("x.pcap", path("link"));
    fs::copy_file(ORVEX_RESOURCES "/LTE.plist", path("LTE.plist"));
    const std::pair<QStringList, std::string> cases[] = {
        {{"--snapshot", name("link")}, "--snapshot " + path("link") + " and the input " + path("x.pcap")},
        {{"--output", name("new"), "--log", name("./new")},
            "--log " + path("./new") + " and --output " + path("new")},
        {{"--output", name("LTE.plist")}, "--output " + path("LTE.plist") + " and the template LTE.plist"},
    };
    for (const auto& [arguments, conflict] : cases) {
        const Result result =
            decode(arguments + QStringList{"--technology", "MRL_LTE", "--resources", name(""), input});
        EXPECT_EQ(result.status, 2) << conflict;
        EXPECT_EQ(result.errors, "orvex-decode: " + conflict + " are the same file\n");
        EXPECT_EQ(contentsOf("x.pcap"), before);
        EXPECT_FALSE(fs::exists(path("new")));
    }
}

TEST_F(DecodeTest, AsksForTheDisplayAfterEveryNMessagesAndNamesAMissingTemplate)
{
    const QString five = capture("five", std::vector<Bytes>(5, {1}));
    // Without a template, each request and each message logs a line.
    for (const auto& [messages, requests] : {std::pair("6", 1), {"2", 3}, {"1", 6}}) {
        const Result result = decode({"--quiet", "--output", name("tree"), "--log", name("log"),
            "--technology", "MRL_LTE", "--resources", name("none"), "--refresh-every", messages, five});
        EXPECT_EQ(result.status, 1);
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(result.errors, "orvex-decode: " + path("none/LTE.plist") + ": No such file or directory\n");
        EXPECT_EQ(contentsOf("tree"), "Orvex: (unknown)\n");
        EXPECT_EQ(QString::fromStdString(contentsOf("log")).count("\n<3>Cannot load template for display\n"),
            5 + requests);
    }
}

TEST_F(DecodeTest, RefusesWrongUsageInOneLine)
{
    const struct {
        const char* arguments;
        const char* error;
    } cases[] = {
        {"", "No capture or snapshot is given."},
        {"--technology GSM x.pcap", "Unknown technology 'GSM'."},
        {"--technology MRL_LTE --format xml x.pcap", "Unknown format 'xml'."},
        {"--technology MRL_LTE --refresh-every 0 x.pcap",
            "--refresh-every takes a number of messages, at least 1."},
        {"--technology MRL_LTE --refresh-every 5m x.pcap",
            "--refresh-every takes a number of messages, at least 1."},
        {"--nonsense", "Unknown option 'nonsense'."},
        {"--technology MRL_LTE x.orvex x.pcap", "Captures and snapshots cannot be combined."},
        {"--snapshot y.orvex x.orvex", "--snapshot goes with captures."},
        {"--refresh-every 5 x.orvex", "--refresh-every goes with captures."},
        {"--technology MRL_LTE --dlf y x.pcap", "--dlf goes with one snapshot."},
        {"--dlf y x.orvex z.orvex", "--dlf goes with one snapshot."},
        {"--technology MRL_LTE --description y x.pcap", "--description goes with --snapshot."},
        {"--technology MRL_LTE --output y --output z x.pcap", "--output is given more than once."},
    };
    for (const auto& [arguments, error] : cases) {
        const Result result = decode(QString(arguments).split(' ', Qt::SkipEmptyParts));
        EXPECT_EQ(result.status, 2) << arguments;
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(result.errors, std::string("orvex-decode: ") + error + "\nTry 'orvex-decode --help'.\n");
    }
    const Result help = decode({"--help"});
    EXPECT_EQ(help.status, 0);
    EXPECT_THAT(help.output, StartsWith("Usage: orvex-decode [options] INPUT...\n"));
}

TEST_F(DecodeTest, SnapshotsKeepTheDisplayOfEveryTechnology)
{
    for (const std::string technology : kTechnologies) {
        SCOPED_TRACE(technology);
        const bool hasDLF = technology != "IFX";
        const QStringList options{"--technology", QString::fromStdString(technology), "--resources",
            ORVEX_RESOURCES, "--format", "json"};
        const Json shown = parsed(decode(options
            + QStringList{"--refresh-every", "4", "--snapshot", name("saved.orvex"), "--description",
                "öst & <west>", QString::fromStdString(capturePath(technology))}))["tree"];

        const Json saved = parsed(decode(options + QStringList{name("saved.orvex")}));
        EXPECT_EQ(saved["description"], "öst & <west>");
        ASSERT_EQ(saved["entries"].size(), hasDLF ? 6 : 5);
        const Json& last = saved["entries"][4];
        EXPECT_THAT(last["description"].get<std::string>(), StartsWith("Snapshot (2"));
        EXPECT_EQ(last["display"], shown);
        // Only the five intervals of the history; for IFX they hold everything.
        EXPECT_EQ(last["decoded"].size(), 3U);
        EXPECT_TRUE(hasDLF || last["decoded"] == shown);

        const Result dlf = decode({"--dlf", name("saved.dlf"), name("saved.orvex")});
        EXPECT_EQ(dlf.status, hasDLF ? 0 : 1);
        EXPECT_EQ(
            dlf.errors, hasDLF ? "" : "orvex-decode: " + path("saved.orvex") + ": holds no binary log\n");
        if (technology == "MRL_CDMA") { // has no extra packets, which a DLF lacks
            EXPECT_EQ(parsed(decode(options + QStringList{name("saved.dlf")}))["tree"], last["decoded"]);
        }
    }
}

TEST_F(DecodeTest, NamesTheValueItCannotSave)
{
    Bytes key = bytesOf("\x5EkSimFile_ICCID"); // 14 characters
    const Bytes files = binaryList({{0xD1, 1, 2}, key, {0x33, 0x7F, 0xF0, 0, 0, 0, 0, 0, 0}});
    const Result result = decode(
        lte + QStringList{"--snapshot", name("saved.orvex"), capture("sim", {packet(0xFF0000, files)})});
    EXPECT_EQ(result.status, 1);
    EXPECT_EQ(result.errors,
        "orvex-decode: " + path("saved.orvex")
            + ": the value at /Data/0/Display/SIM Info/EF-ICCID is a date outside of the years 1 to 9999\n");
}

} // namespace
} // namespace orvex::test
