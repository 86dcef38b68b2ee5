#include "DecodeProgram.h"
#include "PacketText.h"

#include "TextFormat.h"

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>

namespace orvex::test {
namespace {

using Json = nlohmann::ordered_json;
using testing::HasSubstr;

// An antenna packet that shows this number.
Bytes antennas(std::uint8_t count)
{
    return packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, count, 8});
}

class DecodeTest : public DecodeProgram, public testing::Test {
public:
    Result decodeCaptures(const std::vector<Bytes>& captures, QStringList arguments = {}) const
    {
        arguments << "--technology"
                  << "MRL_LTE"
                  << "--resources" << ORVEX_RESOURCES;
        for (std::size_t i = 0; i < captures.size(); ++i)
            arguments << write(text("%zu.pcap", i).c_str(), captures[i]);
        return decode(arguments);
    }
};

TEST_F(DecodeTest, PrintsTheTreeOfTheCaptures)
{
    const std::vector<Bytes> captures = {
        PcapFile().add(antennas(1)).bytes(), PcapFile().add(antennas(4)).bytes()};
    const Result tree = decodeCaptures(captures);
    EXPECT_EQ(tree.status, 0);
    EXPECT_EQ(tree.errors, "");
    EXPECT_THAT(tree.output, HasSubstr("Orvex\n  Serving Cell Info\n"));
    EXPECT_THAT(tree.output, HasSubstr("    Num Tx Antennas: 4\n"));

    const std::string document = decodeCaptures(captures, {"--format", "json"}).output;
    const auto root = Json::parse(document);
    EXPECT_EQ(document, root.dump(2) + "\n");
    EXPECT_EQ(root["name"], "Orvex");
    EXPECT_EQ(root["path"], "/");
    ASSERT_EQ(root["children"].size(), 11U);
    const char* expected =
        R"({"name":"Num Tx Antennas","path":"/Serving Cell Info/Num Tx Antennas","value":"4"})";
    EXPECT_EQ(root["children"][0]["children"].back().dump(), expected);
    EXPECT_EQ(root["children"][3]["children"], Json::array());

    const std::vector<Bytes> nothing = {PcapFile().bytes()};
    EXPECT_EQ(decodeCaptures(nothing).output, "Orvex: (unknown)\n");
    EXPECT_EQ(Json::parse(decodeCaptures(nothing, {"--format", "json"}).output),
        (Json{{"name", "Orvex"}, {"path", "/"}, {"value", "(unknown)"}}));
}

TEST_F(DecodeTest, PrintsDeepTreesCompactAndWithoutPaths)
{
    for (const auto& [levels, hasPaths] : {std::pair(31, true), {32, false}, {250, false}}) {
        std::string list = "<plist>";
        for (int i = 1; i < levels; ++i)
            list += "<dict><key>b\xC3\xA4</key><string>x</string><key>a</key>";
        list += "<dict><key>c</key><string>y</string><key>d</key><string/></dict>";
        for (int i = 1; i < levels; ++i)
            list += "</dict>";
        list += "</plist>";
        const Result result = decode({"--technology", "IFX", "--format", "json",
            write("deep.pcap", PcapFile().add(Bytes(list.begin(), list.end())).bytes())});
        ASSERT_EQ(result.status, 0) << result.errors;
        const auto root = Json::parse(result.output);
        EXPECT_EQ(result.output, root.dump(hasPaths ? 2 : -1) + "\n") << levels;
        EXPECT_EQ(result.output.find("path") != std::string::npos, hasPaths) << levels;
        EXPECT_LT(result.output.size(), hasPaths ? 50'000 : 2 * list.size()) << levels;
    }
}

TEST_F(DecodeTest, WritesDocumentAndLogToFiles)
{
    const Result result = decodeCaptures({PcapFile().add(antennas(4)).add(Bytes(13, 2)).bytes()},
        {"--output", name("tree"), "--log", name("log")});
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_EQ(result.output, "") << "without lines of the console";
    EXPECT_THAT(contentsOf(path("tree")), HasSubstr("Num Tx Antennas: 4\n"));
    EXPECT_THAT(contentsOf(path("log")),
        HasSubstr("\n<4>LTE Serving Cell Info\n<3>Received an unknown log message: 45249\n"
                  "<3>Invalid log type: 2. Dropping.\n"));
}

TEST_F(DecodeTest, SaysInOneLineWhatItCannotReadOrWrite)
{
    const Bytes good = PcapFile().add(antennas(4)).bytes();
    const struct {
        Bytes bytes;
        QStringList arguments;
        int status;
        bool isShown;
        const char* error;
    } cases[] = {
        {PcapFile().add(antennas(4)).cut(1).bytes(), {}, 1, false, "0.pcap: truncated"},
        {PcapFile().add(antennas(4)).add(antennas(9)).cut(1).bytes(), {}, 1, true,
            "(after 1 whole messages)\n"},
        {PcapFile().add(antennas(4)).add(antennas(9), 21).bytes(), {}, 0, true,
            "0.pcap: 1 packets hold only the beginning of their message"},
        {good, {"/no/such/capture"}, 1, true, "orvex-decode: /no/such/capture: No such file or directory\n"},
        {good, {"--output", "/dev/full"}, 1, false, "/dev/full: No space left on device"},
        {good, {"--log", "/dev/full"}, 1, true, "/dev/full: No space left on device"},
        {good, {"--snapshot", "/dev/full"}, 1, true, "/dev/full: No space left on device"},
        {good, {"--output", "/no/such/folder/file"}, 1, false, "/no/such/folder/file: No such file or dir"},
    };
    for (const auto& [bytes, arguments, status, isShown, error] : cases) {
        const Result result = decodeCaptures({bytes}, arguments);
        EXPECT_EQ(result.status, status) << error;
        EXPECT_THAT(result.errors, HasSubstr(error));
        EXPECT_EQ(std::ranges::count(result.errors, '\n'), 1) << error;
        EXPECT_EQ(result.output.find("Num Tx Antennas: 4\n") != std::string::npos, isShown) << error;
    }
}

TEST_F(DecodeTest, RefusesToWriteAFileItReadsOrWritesAlready)
{
    namespace fs = std::filesystem;
    const Bytes bytes = PcapFile().add(antennas(4)).bytes();
    const QString capture = write("x.pcap", bytes);
    fs::create_hard_link(path("x.pcap"), path("hard"));
    fs::create_symlink("x.pcap", path("soft"));
    fs::create_symlink("new", path("dangling"));
    fs::create_directory(path("folder"));
    fs::create_symlink("folder/../dangling", path("further"));
    fs::copy_file(ORVEX_RESOURCES "/LTE.plist", path("LTE.plist"));
    const struct {
        QStringList arguments;
        const char* conflict; // empty: none
    } cases[] = {
        {{"--output", name("x.pcap")}, "--output %1/x.pcap and the input %1/x.pcap"},
        {{"--snapshot", name("folder/../x.pcap")}, "--snapshot %1/folder/../x.pcap and the input %1/x.pcap"},
        {{"--log", name("hard")}, "--log %1/hard and the input %1/x.pcap"},
        {{"--log", name("soft")}, "--log %1/soft and the input %1/x.pcap"},
        {{"--output", name("new"), "--log", name("./new")}, "--log %1/./new and --output %1/new"},
        {{"--output", name("new"), "--log", name("further")}, "--log %1/further and --output %1/new"},
        {{"--log", name("dangling"), "--snapshot", name("further")},
            "--snapshot %1/further and --log %1/dangling"},
        {{"--output", name("LTE.plist")}, "--output %1/LTE.plist and the template LTE.plist"},
        {{"--output", "/dev/null", "--log", "/dev/null"}, ""},
    };
    const QString folder = name(".").chopped(2);
    for (const auto& [arguments, conflict] : cases) {
        const QStringList common{"--technology", "MRL_LTE", "--resources", folder, capture};
        const Result result = decode(arguments + common);
        const bool isConflict = *conflict;
        EXPECT_EQ(result.status, isConflict ? 2 : 0) << conflict;
        EXPECT_EQ(result.errors,
            isConflict
                ? ("orvex-decode: " + QString(conflict).arg(folder) + " are the same file\n").toStdString()
                : "");
        EXPECT_EQ(contentsOf(path("x.pcap")), std::string(bytes.begin(), bytes.end())) << conflict;
        EXPECT_FALSE(fs::exists(path("new"))) << conflict;
    }
}

TEST_F(DecodeTest, AsksForTheDisplayAfterEveryNMessages)
{
    const Bytes five = PcapFile().add({1}).add({1}).add({1}).add({1}).add({1}).bytes();
    // Without a template, each request and each message logs a line.
    const auto failures = [&](const char* messages) {
        const Result result = decode({"--log", name("log"), "--technology", "MRL_LTE", "--resources",
            name("none"), "--refresh-every", messages, write("five.pcap", five)});
        EXPECT_EQ(result.status, 1);
        EXPECT_EQ(result.errors, "orvex-decode: " + path("none/LTE.plist") + ": No such file or directory\n");
        EXPECT_EQ(contentsOf(path("log")).find("No such"), std::string::npos);
        return QString::fromStdString(contentsOf(path("log"))).count("Cannot load template");
    };
    EXPECT_EQ(failures("6"), 5 + 1);
    EXPECT_EQ(failures("2"), 5 + 2 + 1);
    EXPECT_EQ(failures("1"), 5 + 5 + 1);
}

TEST_F(DecodeTest, RefusesWrongUsageInOneLine)
{
    const struct {
        const char* arguments;
        const char* error;
    } cases[] = {
        {"", "No capture or snapshot is given."},
        {"x.pcap", "--technology is required for captures."},
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
        EXPECT_EQ(result.errors, std::string("orvex-decode: ") + error + " Try 'orvex-decode --help'.\n");
    }
    const Result help = decode({"--help"});
    EXPECT_EQ(help.status, 0);
    EXPECT_THAT(help.output, testing::StartsWith("Usage: orvex-decode [options] INPUT...\n"));
    EXPECT_THAT(decode({"--version"}).output, testing::StartsWith("orvex-decode "));
}

} // namespace
} // namespace orvex::test
