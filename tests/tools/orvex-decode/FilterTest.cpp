// orvex-decode as one command among others: streams, JSON for scripts, summaries, branches, differences.

#include "Captures.h"
#include "DecodeProgram.h"
#include "PacketText.h"

#include "TextFormat.h"

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>

#include <filesystem>

namespace orvex::test {
namespace {

using Json = nlohmann::ordered_json;
using testing::HasSubstr;

class FilterTest : public DecodeProgram {
protected:
    static QStringList withResources(QStringList arguments)
    {
        return arguments << "--resources" << ORVEX_RESOURCES;
    }
    using DecodeProgram::capture;
    static QString capture(const char* technology) { return QString::fromStdString(capturePath(technology)); }
    // The last run's document.
    Json json(const QStringList& arguments, int status = 0)
    {
        const Result result = decode(withResources(arguments) << "--format"
                                                              << "json");
        EXPECT_EQ(result.status, status) << result.errors;
        errors = result.errors;
        return Json::parse(result.output);
    }

    std::string errors;
};

// Runs a command line of the shell in which $DECODE is the program.
Result shell(const std::string& command)
{
    const std::string line =
        "export ORVEX_RESOURCES='" ORVEX_RESOURCES "' DECODE='" ORVEX_DECODE "'; " + command;
    return run("/bin/sh", {"-c", QString::fromStdString(line)});
}

TEST_F(FilterTest, GuessesTheTechnologyOfEachCapture)
{
    QStringList captures;
    for (const char* technology : kTechnologies) {
        EXPECT_EQ(json({capture(technology)})["technology"], technology);
        EXPECT_EQ(errors, "");
        captures << capture(technology);
    }
    // In one run, each technology has a session of its own.
    const Json all = json(captures);
    const Result text = decode(withResources(captures));
    for (std::size_t i = 0; i < std::size(kTechnologies); ++i) {
        EXPECT_EQ(all[i]["technology"], kTechnologies[i]);
        const Result alone = decode(withResources({captures[static_cast<int>(i)]}));
        EXPECT_THAT(text.output, HasSubstr(std::string(kTechnologies[i]) + " <==\n" + alone.output));
    }

    const QString extra = capture("extra.pcap", {packetHeader(0xFF0000)});
    EXPECT_THAT(decode({extra}).errors, HasSubstr("its messages do not tell their technology; name it with"));
    EXPECT_THAT(decode({capture("none.pcap", {})}).errors, HasSubstr("holds no messages that"));
}

TEST_F(FilterTest, SaysWhatMessagesLookLikeWhenNoneIsForTheTechnology)
{
    const Result result = decode(withResources({"--technology", "MRL_GSM", capture("MRL_LTE")}));
    EXPECT_EQ(result.status, 0);
    EXPECT_THAT(result.errors,
        testing::MatchesRegex("orvex-decode: " + capturePath("MRL_LTE")
            + ": 0 of [0-9]+ messages were for MRL_GSM; they look like MRL_LTE\n"));
    EXPECT_THAT(result.output, HasSubstr("    GSM Serving Cell\n"));
    EXPECT_EQ(decode(withResources({"--quiet", "--technology", "MRL_GSM", capture("MRL_LTE")})).errors, "");

    const Result unsent = decode({"--technology", "IFX", capture("MRL_CDMA")}); // IFX ends at any packet
    EXPECT_EQ(unsent.output, "Orvex: (unknown)\n");
    EXPECT_THAT(unsent.errors, HasSubstr("messages were for IFX; they look like MRL_CDMA\n"));

    const std::vector<Bytes> many(1'234, packetHeader(0x7777));
    EXPECT_EQ(json({"--technology", "MRL_GSM", capture("many.pcap", many)})["errors"],
        Json({"0 of 1,234 messages were for MRL_GSM"}));
}

TEST_F(FilterTest, TakesAndGivesStandardStreams)
{
    const std::string capture = capturePath("MRL_LTE");
    const Result plain = shell("$DECODE " + capture);
    EXPECT_THAT(plain.output, HasSubstr("  Serving Cell Info\n"));
    for (const char* pipe : {"cat %s | $DECODE -", "gzip -c %s | $DECODE - --output -",
             "xz -c %s | $DECODE --technology MRL_LTE -", "$DECODE - < %s"}) {
        std::string command = pipe;
        const Result result = shell(command.replace(command.find("%s"), 2, capture));
        EXPECT_EQ(result.output, plain.output) << pipe;
        EXPECT_EQ(result.errors, "") << pipe;
    }
    const Result snapshot = shell("$DECODE --snapshot - --output /dev/null - < " + capture);
    EXPECT_THAT(snapshot.output, testing::StartsWith("<?xml"));
    const Result broken = shell("head -c 5000 " + capture + " | $DECODE -");
    EXPECT_EQ(broken.status, 1);
    EXPECT_THAT(
        broken.errors, testing::MatchesRegex("orvex-decode: standard input: truncated .* whole messages.\n"));
    EXPECT_THAT(broken.output, HasSubstr("  Serving Cell Info\n"));

    const std::pair<const char*, const char*> wrong[] = {
        {"- -", "Standard input is given more than once."},
        {"--log - x.pcap", "Only one output can go to standard output; --output FILE moves the tree."},
    };
    for (const auto& [arguments, error] : wrong) {
        const Result result = decode(QString(arguments).split(' '));
        EXPECT_EQ(result.status, 2);
        EXPECT_EQ(result.errors, text("orvex-decode: %s\nTry 'orvex-decode --help'.\n", error));
    }
}

TEST_F(FilterTest, PutsEachCaptureIntoAnEnvelope)
{
    const Bytes antennas = packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, 4, 8});
    const Bytes tooShort = packet(0xB0C2, {0});
    const QString good = capture("good.pcap", {antennas, tooShort, {1}});
    const QString cut = capture("cut.pcap", {antennas, antennas});
    std::filesystem::resize_file(path("cut.pcap"), std::filesystem::file_size(path("cut.pcap")) - 1);
    const Json documents = json({good, "/no/such", cut}, 1);
    ASSERT_EQ(documents.size(), 3U);
    EXPECT_EQ(documents[0]["capture"], good.toStdString());
    EXPECT_EQ(documents[0]["counts"].dump(),
        text(R"({"messages":3,"bytes":%zu,"decoded":1,"tooShort":1,"unwanted":1})",
            antennas.size() + tooShort.size() + 1));
    EXPECT_EQ(documents[0]["tree"]["children"][0]["children"].back()["value"], "4");
    EXPECT_EQ(
        documents[1], (Json{{"schema", 1}, {"capture", "/no/such"}, {"error", "No such file or directory"}}));
    EXPECT_THAT(documents[2]["errors"][0], testing::EndsWith("(after 1 whole messages)"));
    EXPECT_EQ(json({"/no/such"}, 1)["error"], "No such file or directory");
    EXPECT_EQ(json({"/tmp"}, 1)["error"], "Is a directory");

    // A tree shows what was known after its capture, earlier captures included.
    const QString later = capture("later.pcap", {packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, 2, 8})});
    const Json both = json({good, later});
    EXPECT_EQ(both[0]["tree"], documents[0]["tree"]);
    EXPECT_EQ(both[1]["tree"]["children"][0]["children"].back()["value"], "2");

    const Json rsrp =
        json({"--path", "/Serving Cell Measurements/Measured RSRP", capture("MRL_LTE")})["tree"];
    EXPECT_EQ(rsrp.dump(),
        R"({"name":"Measured RSRP","path":"/Serving Cell Measurements/Measured RSRP",)"
        R"("value":"-91.50 dBm","number":-91.5,"unit":"dBm"})");
}

TEST_F(FilterTest, PrintsTheExamplesOfItsDocument)
{
    std::ifstream file(ORVEX_DOCUMENTS "/json.md");
    std::string rest(std::istreambuf_iterator<char>(file), {});
    const auto next = [&rest](const std::string& begin, const char* end) {
        rest.erase(0, rest.find(begin) + begin.size());
        return rest.substr(0, rest.find(end));
    };
    const std::string command = next("    orvex-decode ", "\n");
    const Result result = shell("cd '" ORVEX_DOCUMENTS "/..' && \"$DECODE\" " + command);
    EXPECT_EQ(Json::parse(next("```json\n", "```")), Json::parse(result.output)) << command;
    next("## A summary", "\n");
    EXPECT_THAT(json({"--summary", capture("MRL_LTE")})["summary"],
        testing::Contains(Json::parse(next("```json\n", "```"))));
}

TEST_F(FilterTest, SummarizesTheLogCodesOfACapture)
{
    const QString file = capture("x.pcap",
        {packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, 4, 8}), packet(0xB0C1, {1}), packetHeader(0x1234),
            packetHeader(0x1234), {1, 2}});
    const Result table = decode({"--summary", file});
    const std::string time = "  2023-11-14 22:13:20.654  2023-11-14 22:13:20.654";
    EXPECT_EQ(table.errors, "");
    EXPECT_EQ(table.output,
        file.toStdString()
            + ": MRL_LTE\n"
              "Code       Packets       Bytes   Decoded Too short  Unwanted  First                    "
              "Last                     Name\n"
              "none             1           2         0         0         1"
            + time
            + "\n"
              "0x1234           2          26         0         0         2"
            + time
            + "\n"
              "0xB0C1           2          36         1         1         0"
            + time
            + "  Serving Cell Info\n"
              "total            5          64         1         1         3"
            + time + "\n");
    const Json row = json({"--summary", file})["summary"][2];
    EXPECT_EQ(row.dump(),
        R"({"code":"0xB0C1","name":"Serving Cell Info","packets":2,"bytes":36,"decoded":1,"tooShort":1,)"
        R"("unwanted":0,"first":"2023-11-14T22:13:20.654321Z","last":"2023-11-14T22:13:20.654321Z"})");
}

TEST_F(FilterTest, PrintsTheBranchAtAPath)
{
    const QString lte = capture("MRL_LTE");
    const Result branch = decode(withResources({"--path", "/Reselection Candidates", lte}));
    EXPECT_THAT(branch.output, testing::StartsWith("Reselection Candidates\n  "));
    EXPECT_THAT(branch.output, HasSubstr("\n  Serving EARFCN: 1300\n"));

    decode(withResources({"--snapshot", name("x.orvex"), lte}));
    const Result saved = decode({"--path", "/Reselection Candidates", name("x.orvex")});
    EXPECT_THAT(saved.output, HasSubstr("    Display\n      Serving Cell ID: 106\n"));
    EXPECT_EQ(json({"--path", "/SIM Info", name("x.orvex")})["entries"][0]["display"]["path"], "/SIM Info");

    for (const QString& input : {lte, name("x.orvex")}) {
        const Result none = decode(withResources({"--path", "/Nothing", input}));
        EXPECT_EQ(none.status, 1);
        EXPECT_THAT(none.errors, testing::EndsWith("display is at /Nothing\n"));
    }
}

TEST_F(FilterTest, ComparesTheLastDisplaysOfTwoSnapshots)
{
    const auto save = [this](const char* file, std::uint8_t antennas, const Bytes& more) {
        const QString input = capture("x.pcap", {packet(0xB0C1, {0, 1, 2, 3, 4, 5, 6, antennas, 8}), more});
        decode(withResources({"--snapshot", name(file), input}));
        return name(file);
    };
    // Two neighbours, and one.
    Bytes neighbours = packet(0xB180, Bytes(8 + 2 * 48, 1));
    const QString one = save("one.orvex", 1, {1});
    const QString same = save("same.orvex", 1, {1});
    const QString two = save("two.orvex", 2, neighbours);

    EXPECT_EQ(decode({"--diff", one, same}).status, 0);
    const Result different = decode({"--diff", one, two});
    EXPECT_EQ(different.status, 1);
    EXPECT_THAT(different.output, testing::StartsWith("/Serving Cell Info/Num Tx Antennas: 1 -> 2\n"));
    EXPECT_THAT(different.output, HasSubstr("\n/Neighbor Cells List/0/Physical Cell ID: (absent) -> "));
    const Result quiet = decode({"--diff", "--quiet", one, two});
    EXPECT_EQ(quiet.status, 1);
    EXPECT_EQ(quiet.output, "");

    const Json differences = json({"--diff", "--path", "/Serving Cell Info", one, two}, 1)["differences"];
    EXPECT_EQ(differences.dump(), R"([{"path":"/Serving Cell Info/Num Tx Antennas","from":"1","to":"2"}])");
    EXPECT_EQ(decode({"--diff", one, name("none.orvex")}).status, 2);
    EXPECT_EQ(decode({"--diff", "--path", "/No", one, two}).status, 2);
}

TEST_F(FilterTest, DatesSnapshotsByTheCapture)
{
    decode(withResources({"--snapshot", name("x.orvex"), capture("MRL_LTE")}));
    const Json saved = json({name("x.orvex")});
    EXPECT_EQ(saved["timestamp"], "2026-01-05 08:01:59 +0000");
    EXPECT_EQ(saved["entries"][0]["description"], "Snapshot (2026-01-05 08:01:59 +0000)");
}

} // namespace
} // namespace orvex::test
