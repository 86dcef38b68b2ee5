// The whole road with real programs: koratd, the monitor, and captures of what went between them.

#include "Captures.h"
#include "Environment.h"
#include "KoratClient.h"
#include "KoratProgram.h"

#include "FileStorage.h"
#include "OrvexModel.h"
#include "QtRunLoop.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;

struct Captured {
    std::chrono::microseconds time; // since the first message
    Bytes message;

    bool operator==(const Captured&) const = default;
};

std::vector<Captured> messagesIn(const std::string& path)
{
    std::vector<Captured> result;
    const auto reader = CaptureReader::open(path);
    std::optional<std::chrono::microseconds> start;
    while (reader->next() == CaptureReader::Status::message) {
        start = start.value_or(reader->time());
        result.push_back(
            {reader->time() - *start, Bytes(reader->message().begin(), reader->message().end())});
    }
    return result;
}

class LiveSession : public testing::Test {
protected:
    QString path(const char* name) const { return QString::fromStdString(folder.path(name)); }
    std::size_t countIn(const char* name) const { return messagesIn(folder.path(name)).size(); }

    // The tree that the monitor shows last, in a session with koratd that records so many messages.
    std::string lastTreeOfMonitor(const QStringList& arguments, const char* record, std::size_t count) const
    {
        const KoratProgram korat(folder, arguments + QStringList{"--record", path(record)});
        Program monitor(folder, ORVEX_PATH, {"--console"});
        EXPECT_TRUE(waitUntil([&] { return countIn(record) == count; }, 30s)) << countIn(record);
        turnFor(2500ms); // a refresh comes every two seconds
        EXPECT_EQ(monitor.terminate(), 0);
        const std::string output = monitor.output();
        const auto status = output.rfind("Updated ");
        return status == std::string::npos ? output : output.substr(output.find('\n', status) + 1);
    }

    const ProgramFolder folder{};
};

TEST_F(LiveSession, RecordedPlayedAndRecordedAgainItIsTheSame)
{
    constexpr std::size_t kCount = 2000; // several rounds of most captures
    for (const char* technology : kTechnologies) {
        SCOPED_TRACE(technology);
        const auto record = [&](const char* name, QStringList arguments) {
            arguments << "--technology" << technology << "--rate"
                      << "20000"
                      << "--record" << path(name);
            KoratProgram korat(folder, arguments);
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
        const auto receivedAgain = record("second", {"--capture", path("first"), "--once"});
        EXPECT_TRUE(received == receivedAgain);

        const auto first = messagesIn(folder.path("first"));
        ASSERT_EQ(first.size(), kCount);
        EXPECT_TRUE(std::ranges::equal(first, received, {}, &Captured::message));
        EXPECT_TRUE(first == messagesIn(folder.path("second")));
        // Messages stand at the capture's times, however fast they went.
        EXPECT_GT(first.back().time, 20s);
        EXPECT_TRUE(std::ranges::is_sorted(first, {}, &Captured::time));
    }
}

TEST_F(LiveSession, MonitorAndDecoderShowTheSameOfIt)
{
    constexpr std::size_t kCount = 3000;
    for (const char* technology : {"MRL_LTE", "MRL_CDMA"}) {
        SCOPED_TRACE(technology);
        const std::string live = lastTreeOfMonitor(
            {"--technology", technology, "--rate", "10000", "--count", QString::number(kCount)}, "live",
            kCount);
        Program decoder(folder, ORVEX_DECODE, {"--technology", technology, path("live")});
        EXPECT_EQ(decoder.waitForEnd(), 0) << decoder.errors();
        EXPECT_GT(live.size(), 500U);
        EXPECT_EQ(live, decoder.output());
    }
}

// The session of the application, inside the test.
class Session {
public:
    explicit Session(const ProgramFolder& folder)
        : _ports(folder.ports())
    {
        _model->restartMonitor();
    }
    std::size_t messages() const { return _model->decodedMessages(); }

private:
    QtRunLoop _runLoop;
    SocketMessagePorts _ports;
    KoratTelephonyService _telephony{_ports};
    const FileResources _resources{FileResources::defaultDirectory()};
    const SystemClock _clock;
    const std::shared_ptr<OrvexModel> _model = OrvexModel::create({.runLoop = _runLoop,
        .ports = _ports,
        .telephony = _telephony,
        .generators = {.resources = _resources, .clock = _clock, .buildVersion = std::nullopt}});
};

TEST_F(LiveSession, EveryMessageSentIsDecodedAtItsPace)
{
    constexpr std::size_t kCount = 20'000;
    constexpr int kRate = 10'000;
    KoratProgram korat(folder, {"--rate", QString::number(kRate), "--count", QString::number(kCount)});
    QElapsedTimer elapsed;
    elapsed.start();
    const Session session(folder);
    EXPECT_TRUE(waitUntil([&] { return session.messages() >= kCount; }, 60s));
    EXPECT_GE(elapsed.elapsed(), static_cast<qint64>(kCount * 1000) / kRate - 100);
    turnFor(200ms);
    EXPECT_EQ(session.messages(), kCount);
    EXPECT_EQ(korat.terminateAndCount(), kCount);
}

TEST_F(LiveSession, AServiceThatHasGoneIsHeardToItsLastMessage)
{
    constexpr std::size_t kCount = 150;
    KoratProgram korat(folder, {"--rate", "100", "--count", QString::number(kCount)});
    const Session session(folder);
    EXPECT_TRUE(waitUntil([&] { return session.messages() > 0; }));

    // The event loop stands still until a refresh is due, which finds the service gone.
    std::this_thread::sleep_for(1800ms);
    korat.kill();
    std::this_thread::sleep_for(500ms);
    EXPECT_TRUE(waitUntil([&] { return session.messages() >= kCount; })) << session.messages();
}

TEST_F(LiveSession, FullDiskEndsTheRecordingOnly)
{
    // A limit of the file's size stands for the disk.
    Program korat(folder, "/bin/sh",
        {"-c", R"(trap '' XFSZ; ulimit -f 16; exec "$0" "$@")", KORATD_PATH, "--rate", "2000", "--record",
            path("capture")});
    KoratClient client(folder.ports());
    ASSERT_TRUE(waitUntil([&] { return client.open() == 0; }));
    client.send();
    ASSERT_TRUE(korat.waitForError("File too large; recording ends here"));
    const std::size_t before = client.messages.size();
    EXPECT_TRUE(waitUntil([&] { return client.messages.size() > before + 1000; }));
    EXPECT_EQ(korat.terminate(), 0);
    EXPECT_EQ(QString::fromStdString(korat.errors()).count("recording ends"), 1) << korat.errors();
    EXPECT_GT(countIn("capture"), 10U);
}

TEST_F(LiveSession, FileNamesAreBytes)
{
    const std::string root = folder.path(".");
    const std::string odd = root + "/\xff\xe4"; // in no locale's encoding
    std::filesystem::create_directory(odd);
    const std::pair<const char*, const char*> variables[] = {{"FOLDER", root.c_str()},
        {"KORATD", KORATD_PATH}, {"ORVEX", ORVEX_PATH}, {"DECODE", ORVEX_DECODE},
        {"RESOURCES", ORVEX_RESOURCES}};
    for (const auto& [name, value] : variables)
        setEnvironment(name, value);
    const struct {
        const char* script;
        int status;
        const char* said;
    } cases[] = {
        {"rm -f $ODD/*; $KORATD --record $ODD/capture & while [ ! -s $ODD/capture ]; do sleep .1; done; kill "
         "$!; wait $!",
            0, "koratd: sent 0 messages"},
        {"cp $RESOURCES/LTE.plist $ODD; $DECODE --technology MRL_LTE --resources $ODD --output $ODD/tree"
         " --log $ODD/log --snapshot $ODD/snapshot $ODD/capture && cat $ODD/tree && test -s $ODD/log",
            0, "Orvex: (unknown)"},
        {"$DECODE --dlf $ODD/dlf $ODD/snapshot && test -s $ODD/dlf", 0, "DLF binary (161 bytes)"},
        {"$ORVEX --console --open $ODD/snapshot", 0, "Saved "},
        {"$ORVEX --console $ODD", 1, R"(\xff\xe4: )"},
        {"$KORATD --capture $ODD/log", 1, R"(\xff\xe4/log: neither a pcap nor a DLF file)"},
    };
    for (const char* locale : {"C", "C.UTF-8"}) {
        setEnvironment("LC_ALL", locale);
        for (const auto& [script, status, said] : cases) {
            Program shell(
                folder, "/bin/sh", {"-c", QString(R"(ODD=$(printf "$FOLDER/\377\344"); )") + script});
            EXPECT_EQ(shell.waitForEnd(), status) << locale << ' ' << script << '\n' << shell.errors();
            EXPECT_THAT(shell.output() + shell.errors(), testing::HasSubstr(said)) << locale << ' ' << script;
        }
    }
    setEnvironment("LC_ALL", nullptr);
    std::filesystem::remove_all(odd); // Qt cannot
}

TEST_F(LiveSession, EndsWhenItsWindowWasPaintedIfItIsTo)
{
    Program monitor(folder, ORVEX_PATH, {"--until-painted"});
    EXPECT_EQ(monitor.waitForEnd(), 0) << monitor.errors();
    EXPECT_EQ(monitor.output(), "painted\n");
}

// Each line is run by a shell; the program is $1, and $2 a file. What stands still would do so for ever.
TEST_F(LiveSession, EndsInTimeWhateverStandsStill)
{
    using namespace std::chrono_literals;
    const struct {
        const char* name;
        const char* program;
        std::string line;
        int status;
        const char* errors;
    } cases[] = {
        {"reader gone", ORVEX_PATH, "{ $1 --console; echo $? > $2; } | true; exit $(cat $2)", 0, ""},
        {"no room", ORVEX_PATH, "exec $1 --console > /dev/full", 1,
            "orvex: standard output: No space left on device\n"},
        {"no standard output", ORVEX_PATH, "exec $1 --console >&-", 1,
            "orvex: standard output: Bad file descriptor\n"},
        {"output stuck", ORVEX_PATH,
            "mkfifo $2; exec 3<> $2; head -c 65536 /dev/zero >&3; $1 --console >&3 & p=$!; sleep 0.7; "
            "kill $p; wait $p",
            128 + SIGTERM, "Terminated\n"},
        {"log stuck", ORVEX_PATH,
            "mkfifo $2; exec 3<> $2; head -c 65536 /dev/zero >&3; $1 --console > /dev/null 2>&3 & p=$!; "
            "sleep 0.7; kill -HUP $p; wait $p",
            128 + SIGHUP, "Hangup\n"},
        {"readers of koratd's lines gone", KORATD_PATH,
            "{ $1 2>&3 & p=$!; sleep 0.5; kill -0 $p && kill -INT $p; wait $p; echo $? > $2; } 3>&1 | true; "
            "exit $(cat $2)",
            0, ""},
    };
    for (const auto& [name, program, line, status, errors] : cases) {
        const ProgramFolder own;
        const auto start = std::chrono::steady_clock::now();
        Program shell(own, "/bin/sh",
            {"-c", QString::fromStdString(line), "sh", program, QString::fromStdString(own.path("file"))});
        EXPECT_EQ(shell.waitForEnd(), status) << name;
        EXPECT_LT(std::chrono::steady_clock::now() - start, 10s) << name;
        EXPECT_EQ(shell.errors(), errors) << name;
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
        EXPECT_TRUE(monitor.waitForError(line)) << fault;
        EXPECT_THAT(monitor.output(), testing::Not(testing::HasSubstr("Updated")));
        EXPECT_EQ(monitor.terminate(), 0) << monitor.errors();
    }
}

} // namespace
} // namespace orvex::test
