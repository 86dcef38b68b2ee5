// The whole road with real programs: koratd, the monitor, and captures of what went between them.

#include "Captures.h"
#include "KoratClient.h"
#include "Programs.h"

#include <gmock/gmock.h>

#include <QDateTime>

#include <algorithm>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <map>
#include <sstream>
#include <thread>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;
using testing::HasSubstr;

class LiveSession : public testing::Test {
protected:
    using Captured = std::pair<std::chrono::microseconds, Bytes>; // since the first message

    std::vector<Captured> messagesIn(const char* name) const
    {
        std::vector<Captured> result;
        const auto reader = CaptureReader::open(folder.path(name));
        std::optional<std::chrono::microseconds> start;
        while (reader->next() == CaptureReader::Status::message) {
            start = start.value_or(reader->time());
            result.emplace_back(
                reader->time() - *start, Bytes(reader->message().begin(), reader->message().end()));
        }
        return result;
    }

    const ProgramFolder folder{};
};

TEST_F(LiveSession, RecordedPlayedAndRecordedAgainItIsTheSame)
{
    constexpr std::size_t kCount = 2000; // several rounds of most captures
    for (const char* technology : kTechnologies) {
        SCOPED_TRACE(technology);
        const auto record = [&](const char* name, const QStringList& arguments) {
            KoratProgram korat(folder,
                QStringList{"--technology", technology, "--rate", "20000", "--record", folder.name(name)}
                    + arguments);
            KoratClient client(folder.ports());
            EXPECT_EQ(client.open(), 0);
            EXPECT_EQ(client.technology(), Value(technology));
            client.send();
            EXPECT_TRUE(waitUntil([&] { return client.messages.size() >= kCount; }, 20s));
            turnFor(50ms); // in which nothing more comes
            EXPECT_EQ(korat.terminateAndCount(), kCount);
            return client.messages;
        };
        const auto received = record("first", {"--count", QString::number(kCount)});
        EXPECT_TRUE(record("second", {"--capture", folder.name("first"), "--once"}) == received);
        const auto first = messagesIn("first");
        ASSERT_EQ(first.size(), kCount);
        EXPECT_TRUE(std::ranges::equal(first, received, {}, &Captured::second));
        EXPECT_TRUE(first == messagesIn("second"));
        // Messages stand at the capture's times, however fast they went.
        EXPECT_GT(first.back().first, 20s);
        EXPECT_TRUE(std::ranges::is_sorted(first, {}, &Captured::first));
    }
}

TEST_F(LiveSession, MonitorAndDecoderShowTheSameOfIt)
{
    constexpr std::size_t kCount = 3000;
    for (const char* technology : {"MRL_LTE", "MRL_CDMA"}) {
        SCOPED_TRACE(technology);
        std::string live;
        {
            const KoratProgram korat(folder,
                {"--technology", technology, "--rate", "10000", "--count", QString::number(kCount),
                    "--record", folder.name("live")});
            Program monitor(folder, ORVEX_PATH, {"--console"});
            EXPECT_TRUE(waitUntil([&] { return messagesIn("live").size() == kCount; }, 30s));
            turnFor(2500ms); // a refresh comes every two seconds
            EXPECT_EQ(monitor.terminate(), 0);
            live = monitor.output();
        }
        live.erase(0, live.find('\n', live.rfind("Updated ")) + 1);
        EXPECT_GT(live.size(), 500U);
        EXPECT_EQ(live, run(ORVEX_DECODE, {"--technology", technology, folder.name("live")}).output);
    }
}

// The last text of each row in a timeline.
std::map<std::string, std::string> lastTexts(const std::string& csv)
{
    std::map<std::string, std::string> result;
    std::istringstream lines(csv.substr(csv.find('\n') + 1));
    for (std::string line; std::getline(lines, line);) {
        const auto text = line.find(line.find(",\"") < line.find(",,") ? "\"," : ",,") + 2;
        EXPECT_TRUE(line.ends_with('\r')) << line;
        result[line.substr(25, text - 25)] = line.substr(text);
    }
    return result;
}

TEST_F(LiveSession, MonitorAndDecoderRecordTheSameTimeline)
{
    constexpr std::size_t kCount = 500;
    const KoratProgram korat(folder,
        {"--technology", "MRL_LTE", "--rate", "1000", "--count", QString::number(kCount), "--record",
            folder.name("live")});
    Program monitor(
        folder, ORVEX_PATH, {"--console", "--timeline", folder.name("live.csv"), "--every", "0.2"});
    EXPECT_TRUE(waitUntil([&] { return messagesIn("live").size() == kCount; }, 30s));
    turnFor(700ms);
    monitor.kill(); // what was recorded stays
    const auto read = [this](const char* name) {
        std::ifstream stream(folder.path(name), std::ios::binary);
        return std::string(std::istreambuf_iterator<char>(stream), {});
    };
    const std::string live = read("live.csv");
    EXPECT_EQ(run(ORVEX_DECODE, {"--timeline", folder.name("offline.csv"), folder.name("live")}).status, 0);
    const auto rows = lastTexts(live);
    const auto decoded = lastTexts(read("offline.csv"));
    EXPECT_GT(rows.size(), 80U);
    for (const auto& [row, text] : rows)
        EXPECT_EQ(text, decoded.contains(row) ? decoded.at(row) : ",,\r") << row;

    // By the clock on the wall.
    const auto now = QDateTime::currentDateTimeUtc();
    const auto last = QDateTime::fromString(
        QString::fromStdString(live.substr(live.rfind('\n', live.size() - 2) + 1, 24)), Qt::ISODateWithMs);
    EXPECT_LT(std::abs(last.secsTo(now)), 20);
}

TEST_F(LiveSession, AServiceThatHasGoneIsHeardToItsLastMessage)
{
    KoratProgram korat(folder, {"--rate", "100", "--count", "300"});
    const Program monitor(folder, ORVEX_PATH, {"--print-status"});
    ASSERT_TRUE(monitor.waitFor(" Updated "));
    // The monitor stands still until its next refresh is due, which finds the service gone.
    ::kill(monitor.id(), SIGSTOP);
    std::this_thread::sleep_for(1800ms);
    korat.kill();
    std::this_thread::sleep_for(500ms);
    ::kill(monitor.id(), SIGCONT);
    EXPECT_TRUE(monitor.waitFor("\n300 ")) << monitor.output();
}

TEST_F(LiveSession, FullDiskEndsTheRecordingOnly)
{
    // A limit of the file's size stands for the disk.
    Program korat(folder, "/bin/sh",
        {"-c", R"(trap '' XFSZ; ulimit -f 16; exec "$0" "$@")", KORATD_PATH, "--rate", "2000", "--record",
            folder.name("capture")});
    KoratClient client(folder.ports());
    ASSERT_TRUE(waitUntil([&] { return client.open() == 0; }));
    client.send();
    ASSERT_TRUE(korat.waitFor("File too large; recording ends here"));
    const std::size_t before = client.messages.size();
    EXPECT_TRUE(waitUntil([&] { return client.messages.size() > before + 1000; }));
    EXPECT_EQ(korat.terminate(), 0);
    EXPECT_EQ(QString::fromStdString(korat.errors()).count("recording ends"), 1) << korat.errors();
    EXPECT_GT(messagesIn("capture").size(), 10U);
}

// Each line is run by a shell, in its own folder. What stands still would do so for ever.
class ShellTest : public testing::Test {
protected:
    static Result shell(const std::string& line)
    {
        return run("/bin/sh",
            {"-c",
                "ORVEX=$0 KORATD=$1 DECODE=$2 RESOURCES=$3; mkdir -p $XDG_STATE_HOME; cd $XDG_STATE_HOME; "
                    + QString::fromStdString(line),
                ORVEX_PATH, KORATD_PATH, ORVEX_DECODE, ORVEX_RESOURCES});
    }
};

TEST_F(ShellTest, FileNamesAreBytes)
{
    const struct {
        const char* script;
        int status;
        const char* said;
    } cases[] = {
        {"$KORATD --record $ODD/capture & while [ ! -s $ODD/capture ]; do sleep .1; done; kill $!; wait $!",
            0, "koratd: sent 0 messages"},
        {"cp $RESOURCES/LTE.plist $ODD; $DECODE --technology MRL_LTE --resources $ODD --output $ODD/tree"
         " --log $ODD/log --snapshot $ODD/snapshot $CAPTURE && cat $ODD/tree && test -s $ODD/log && "
         "$DECODE --dlf $ODD/dlf $ODD/snapshot && test -s $ODD/dlf && $ORVEX --console --open $ODD/snapshot",
            0, "Saved "},
        {"$ORVEX --console $ODD", 1, R"(\xff\xe4: )"},
        {"echo x > $ODD/log; $KORATD --capture $ODD/log", 1,
            R"(\xff\xe4/log: neither a pcap nor a DLF file)"},
    };
    for (const std::string locale : {"C", "C.UTF-8"}) {
        for (const auto& [script, status, said] : cases) {
            const auto [result, output, errors] = shell("export LC_ALL=" + locale
                + " CAPTURE=" ORVEX_CAPTURES "/MRL_LTE.pcap; ODD=$(printf '\\377\\344'); mkdir $ODD; ("
                + script + "); s=$?; rm -r $ODD; exit $s");
            EXPECT_EQ(result, status) << locale << ' ' << script << '\n' << errors;
            EXPECT_THAT(output + errors, HasSubstr(said)) << locale << ' ' << script;
        }
    }
}

TEST_F(ShellTest, ProgramsEndInTimeWhateverStandsStill)
{
    const struct {
        const char* name;
        const char* line;
        int status;
        const char* errors;
    } cases[] = {
        {"painted, as was asked for", "[ $($ORVEX --until-painted 2> /dev/null) = painted ]", 0, ""},
        {"reader gone", "{ $ORVEX --console; echo $? > s; } | true; exit $(cat s)", 0, ""},
        {"no room", "exec $ORVEX --console > /dev/full", 1,
            "orvex: standard output: No space left on device\n"},
        {"no room for a timeline", "$ORVEX --console --timeline /dev/full", 1,
            "orvex: /dev/full: No space left on device\n"},
        {"no folder for a timeline", "$ORVEX --console --timeline none/x.csv", 1,
            "orvex: none/x.csv: No such file or directory\n"},
        {"no standard streams", "$ORVEX --console >&- <&-", 1,
            "orvex: standard output: Bad file descriptor\n"},
        {"output stuck",
            "mkfifo f; exec 3<> f; head -c 65536 /dev/zero >&3; $ORVEX --console >&3 & p=$!; sleep 0.7; "
            "kill $p; wait $p",
            128 + SIGTERM, "Terminated\n"},
        {"log stuck",
            "mkfifo f; exec 3<> f; head -c 65536 /dev/zero >&3; $ORVEX --console > /dev/null 2>&3 & p=$!; "
            "sleep 0.7; kill -HUP $p; wait $p",
            128 + SIGHUP, "Hangup\n"},
        {"readers of koratd's lines gone",
            "{ $KORATD 2>&3 & p=$!; sleep 0.5; kill -0 $p && kill -INT $p; wait $p; echo $? > s; } 3>&1 | "
            "true; "
            "exit $(cat s)",
            0, ""},
    };
    for (const auto& [name, line, status, errors] : cases) {
        const auto start = std::chrono::steady_clock::now();
        const Result result = shell(line);
        EXPECT_EQ(result.status, status) << name;
        EXPECT_LT(std::chrono::steady_clock::now() - start, 10s) << name;
        EXPECT_EQ(result.errors, errors) << name;
    }
}

TEST_F(LiveSession, AFaultIsLoggedAndLeavesTheMonitorConnecting)
{
    const std::pair<const char*, const char*> cases[] = {
        {"refuse-channel=35", "_KoratServerConnectionNetworkMonitorCreateLogChannel returns error: 35!"},
        {"null-port", "Could not create a log channel (Korat returned null port)!"},
        {"no-reply", " ***** No response to GetTechnology; cannot configure"},
        {"bad-reply", " ***** Could not parse reply to GetTechnology; cannot configure"},
        {"unknown-technology", "No log generator technology works"},
    };
    for (const auto& [fault, line] : cases) {
        const KoratProgram korat(folder, {"--fault", fault});
        Program monitor(folder, ORVEX_PATH, {"--console"});
        EXPECT_TRUE(monitor.waitFor(line)) << fault;
        EXPECT_THAT(monitor.output(), testing::Not(HasSubstr("Updated")));
        EXPECT_EQ(monitor.terminate(), 0) << monitor.errors();
    }
}

} // namespace
} // namespace orvex::test
