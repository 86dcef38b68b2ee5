#include "DecodeProgram.h"
#include "PacketText.h"
#include "PcapFile.h"

#include "TextFormat.h"

#include <nlohmann/json.hpp>

#include <gmock/gmock.h>

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
            arguments << QString::fromStdString(
                file(text("%d.pcap", static_cast<int>(i)).c_str(), captures[i]));
        return decode(arguments);
    }
};

TEST_F(DecodeTest, PrintsTheTreeOfWhatTheCapturesHold)
{
    const struct {
        const char* name;
        PcapFile capture;
    } forms[] = {
        {"little-endian, microseconds", PcapFile()},
        {"big-endian, microseconds", PcapFile(147, true)},
        {"little-endian, nanoseconds", PcapFile(147, false, 0xA1B23C4D)},
        {"big-endian, nanoseconds", PcapFile(147, true, 0xA1B23C4D)},
    };
    for (const auto& [name, capture] : forms) {
        PcapFile filled = capture;
        const Result result = decodeCaptures({filled.add(antennas(2)).add(antennas(4)).bytes()});
        EXPECT_EQ(result.status, 0) << name << ": " << result.errors;
        EXPECT_EQ(result.errors, "") << name;
        EXPECT_THAT(result.output, HasSubstr("Orvex\n  Serving Cell Info\n")) << name;
        EXPECT_THAT(result.output, HasSubstr("    Num Tx Antennas: 4\n")) << name;
    }
    const Result inOrder =
        decodeCaptures({PcapFile().add(antennas(1)).bytes(), PcapFile().add(antennas(3)).bytes()});
    EXPECT_THAT(inOrder.output, HasSubstr("Num Tx Antennas: 3\n"));
}

TEST_F(DecodeTest, PrintsTheTreeAsJSON)
{
    const Result result = decodeCaptures({PcapFile().add(antennas(4)).bytes()}, {"--format", "json"});
    const auto root = Json::parse(result.output);
    EXPECT_EQ(root["name"], "Orvex");
    EXPECT_EQ(root["path"], "/");
    ASSERT_EQ(root["children"].size(), 11U);
    const auto& serving = root["children"][0];
    EXPECT_EQ(serving["path"], "/Serving Cell Info");
    const char* expected =
        R"({"name":"Num Tx Antennas","path":"/Serving Cell Info/Num Tx Antennas","value":"4"})";
    EXPECT_EQ(serving["children"].back().dump(), expected);
    EXPECT_EQ(root["children"][3]["children"], Json::array());
}

TEST_F(DecodeTest, SessionInWhichNothingArrivedHasNoDisplayYet)
{
    EXPECT_EQ(decodeCaptures({PcapFile().bytes()}).output, "Orvex: (unknown)\n");
    const Result json = decodeCaptures({PcapFile().bytes()}, {"--format", "json"});
    EXPECT_EQ(json.status, 0);
    EXPECT_EQ(Json::parse(json.output), (Json{{"name", "Orvex"}, {"path", "/"}, {"value", "(unknown)"}}));
}

TEST_F(DecodeTest, SaysInOneLineWhyACaptureCannotBeRead)
{
    const struct {
        const char* name;
        Bytes bytes;
        const char* why;
    } cases[] = {
        {"no pcap file", Bytes(100, 'x'), "0.pcap: neither a pcap nor a DLF file"},
        {"zero bytes", {}, "0.pcap: neither a pcap nor a DLF file"},
        {"another link type", PcapFile(1).add(antennas(4)).bytes(),
            "0.pcap: its link type is 1; log messages have 147 (USER0)"},
        {"cut in the first packet", PcapFile().add(antennas(4)).cut(1).bytes(), "0.pcap: truncated"},
    };
    for (const auto& [name, bytes, why] : cases) {
        const Result result = decodeCaptures({bytes});
        EXPECT_EQ(result.status, 1) << name;
        EXPECT_EQ(result.output, "") << name;
        EXPECT_THAT(result.errors, HasSubstr(why)) << name;
        EXPECT_EQ(std::count(result.errors.begin(), result.errors.end(), '\n'), 1) << name;
    }
    const Result missing = decode({"--technology", "MRL_LTE", "/no/such/capture"});
    EXPECT_EQ(missing.status, 1);
    EXPECT_EQ(missing.errors, "orvex-decode: /no/such/capture: No such file or directory\n");
}

TEST_F(DecodeTest, CutCaptureShowsWhatWasWholeAndSaysSo)
{
    for (const std::size_t cut : {std::size_t{1}, antennas(9).size(), antennas(9).size() + 15}) {
        const Result result = decodeCaptures({PcapFile().add(antennas(4)).add(antennas(9)).cut(cut).bytes()});
        EXPECT_EQ(result.status, 1) << cut;
        EXPECT_THAT(result.output, HasSubstr("Num Tx Antennas: 4\n")) << cut;
        EXPECT_THAT(result.errors, HasSubstr("(after 1 whole messages)")) << cut;
    }
    const Result partial = decodeCaptures({PcapFile().add(antennas(4)).add(antennas(9), 21).bytes()});
    EXPECT_EQ(partial.status, 0);
    EXPECT_THAT(partial.output, HasSubstr("Num Tx Antennas: 4\n"));
    EXPECT_THAT(partial.errors, HasSubstr("1 packets hold only the beginning of their message"));
}

TEST_F(DecodeTest, SaysInOneLineWhatOfADlfMakesNoRecord)
{
    Bytes record = antennas(4); // as koratd writes it, without its log type
    record.erase(record.begin());
    record[0] = static_cast<std::uint8_t>(record.size());
    record[1] = 0;
    const auto joined = [](std::initializer_list<Bytes> parts) {
        Bytes result;
        for (const Bytes& part : parts)
            result.insert(result.end(), part.begin(), part.end());
        return result;
    };
    const Bytes beyond = {0xFF, 0x7F, 0xC1, 0xB0};
    const struct {
        const char* name;
        Bytes bytes;
        int status;
        const char* why;
    } cases[] = {
        {"whole", joined({record, record}), 0, ""},
        {"cut", joined({record, record, Bytes(record.begin(), record.end() - 1)}), 1,
            "20 bytes that make no record were skipped (after 2 whole messages)\n"},
        {"lengths of zero", joined({record, record, Bytes(40)}), 1,
            "40 bytes that make no record were skipped (after 2 whole messages)\n"},
        {"a length beyond the end", joined({record, record, beyond}), 1,
            "4 bytes that make no record were skipped (after 2 whole messages)\n"},
    };
    for (const auto& [name, bytes, status, why] : cases) {
        const Result result = decodeCaptures({bytes});
        EXPECT_EQ(result.status, status) << name << ": " << result.errors;
        EXPECT_THAT(result.output, HasSubstr("Num Tx Antennas: 4\n")) << name;
        const std::string line = *why ? "orvex-decode: " + path("0.pcap") + ": " + why : "";
        EXPECT_EQ(result.errors, line) << name;
    }
}

TEST_F(DecodeTest, WritesDocumentAndLogIntoFiles)
{
    const Result result = decodeCaptures({PcapFile().add(antennas(4)).add(Bytes(13, 2)).bytes()},
        {"--output", QString::fromStdString(path("tree")), "--log", QString::fromStdString(path("log"))});
    EXPECT_EQ(result.status, 0) << result.errors;
    EXPECT_EQ(result.output, "") << "lines of the console stay out of the document";
    EXPECT_THAT(contentsOf(path("tree")), HasSubstr("Num Tx Antennas: 4\n"));
    EXPECT_THAT(contentsOf(path("log")),
        HasSubstr("\n<4>LTE Serving Cell Info\n<3>Received an unknown log message: 45249\n"
                  "<3>Invalid log type: 2. Dropping.\n"));
    const Result unwritable = decodeCaptures({PcapFile().bytes()}, {"--output", "/no/such/folder/file"});
    EXPECT_EQ(unwritable.status, 1);
    EXPECT_EQ(unwritable.errors, "orvex-decode: /no/such/folder/file: No such file or directory\n");
}

TEST_F(DecodeTest, AsksForTheDisplayAsOftenAsItIsTold)
{
    // Without a template every request says so once, and every message does.
    const auto failures = [this](const QStringList& arguments) {
        QStringList all = arguments;
        all << "--log" << QString::fromStdString(path("log")) << "--technology"
            << "MRL_LTE"
            << "--resources" << QString::fromStdString(path(""))
            << QString::fromStdString(
                   file("five.pcap", PcapFile().add({1}).add({1}).add({1}).add({1}).add({1}).bytes()));
        EXPECT_EQ(decode(all).output, "Orvex: (unknown)\n");
        const std::string log = contentsOf(path("log"));
        std::size_t count = 0;
        for (auto at = log.find("Cannot load template"); at != std::string::npos;
             at = log.find("Cannot load template", at + 1))
            ++count;
        return count;
    };
    EXPECT_EQ(failures({}), 5U + 1U);
    EXPECT_EQ(failures({"--refresh-every", "2"}), 5U + 2U + 1U);
    EXPECT_EQ(failures({"--refresh-every", "1"}), 5U + 5U + 1U);
}

TEST_F(DecodeTest, FatalMessageEndsItWithTheReason)
{
    const Result result = decodeCaptures(
        {PcapFile().add(packet(0xFF0000, {'x'})).bytes()}, {"--log", QString::fromStdString(path("log"))});
    EXPECT_EQ(result.status, -1) << "ended by its exception";
    EXPECT_THAT(contentsOf(path("log")), HasSubstr("<3>SIM File dictionary data could not be constructed\n"));
    EXPECT_THAT(contentsOf(path("log")), HasSubstr("UnknownDataException"));
}

TEST_F(DecodeTest, WrongUsageIsAnsweredWithTheRightOne)
{
    const std::vector<QStringList> cases = {{}, {"x.pcap"}, {"--technology", "MRL_LTE"},
        {"--technology", "GSM", "x.pcap"}, {"--technology", "MRL_LTE", "--format", "xml", "x.pcap"},
        {"--technology", "MRL_LTE", "--refresh-every", "0", "x.pcap"}, {"--nonsense"},
        {"--technology", "MRL_LTE", "x.orvex", "x.pcap"}, {"--snapshot", "y.orvex", "x.orvex"},
        {"--technology", "MRL_LTE", "--dlf", "y", "x.pcap"}, {"--dlf", "y", "x.orvex", "z.orvex"},
        {"--technology", "MRL_LTE", "--description", "y", "x.pcap"}, {"--technology", "GSM", "x.orvex"}};
    for (const QStringList& arguments : cases) {
        const Result result = decode(arguments);
        EXPECT_EQ(result.status, 2) << arguments.join(' ').toStdString();
        EXPECT_EQ(result.output, "");
        EXPECT_THAT(result.errors, HasSubstr("Usage: orvex-decode"));
    }
    const Result help = decode({"--help"});
    EXPECT_EQ(help.status, 0);
    EXPECT_THAT(help.output, HasSubstr("Usage: orvex-decode"));
    EXPECT_THAT(decode({"--version"}).output, testing::StartsWith("orvex-decode "));
}

} // namespace
} // namespace orvex::test
