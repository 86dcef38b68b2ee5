// koratd with captures: recording what it streams, and replaying it to the monitor and to itself.

#include "KoratClient.h"
#include "KoratProgram.h"

#include "Array.h"
#include "CaptureReader.h"

#include <QFile>

#include <gmock/gmock.h>

#include <algorithm>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;
using testing::HasSubstr;

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

DictionaryRef everything()
{
    return Dictionary::make({{"SetState", "Streaming"}});
}

class CaptureSession : public testing::Test {
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

TEST_F(CaptureSession, RecordedReplayedAndRecordedAgainItIsTheSame)
{
    constexpr std::size_t kCount = 2000;
    for (const char* technology : {"MRL_LTE", "MRL_GSM", "MRL_UTRAN2", "MRL_CDMA", "IFX"}) {
        SCOPED_TRACE(technology);
        const auto record = [&](const char* name, const QStringList& arguments) {
            KoratProgram korat(folder,
                arguments
                    + QStringList{"--technology", technology, "--rate", "20000", "--record", path(name)});
            KoratClient client(folder.ports());
            EXPECT_EQ(client.open(), 0);
            EXPECT_EQ(client.technology(), Value(technology));
            client.send(everything());
            EXPECT_TRUE(waitUntil([&] { return client.messages.size() >= kCount; }, 20s));
            EXPECT_EQ(korat.terminateAndCount(), kCount);
            return client.messages;
        };
        const auto received = record("first", {"--count", QString::number(kCount)});
        const auto receivedAgain = record("second", {"--replay", path("first")});
        EXPECT_TRUE(received == receivedAgain);

        const auto first = messagesIn(folder.path("first"));
        ASSERT_EQ(first.size(), kCount);
        EXPECT_TRUE(std::ranges::equal(first, received, {}, &Captured::message));
        EXPECT_TRUE(first == messagesIn(folder.path("second")));
        // Messages stand at the scenario's times, however fast they went.
        EXPECT_GT(first.back().time, 20s);
    }
}

TEST_F(CaptureSession, MonitorAndDecoderShowTheSameOfIt)
{
    constexpr std::size_t kCount = 3000;
    for (const char* technology : {"MRL_LTE", "MRL_CDMA"}) {
        SCOPED_TRACE(technology);
        const QStringList arguments = {"--technology", technology, "--rate", "10000"};
        const std::string live =
            lastTreeOfMonitor(arguments + QStringList{"--count", QString::number(kCount)}, "live", kCount);
        const std::string replayed =
            lastTreeOfMonitor(arguments + QStringList{"--replay", path("live")}, "replayed", kCount);
        Program decoder(folder, ORVEX_DECODE, {"--technology", technology, path("live")});
        EXPECT_EQ(decoder.waitForEnd(), 0) << decoder.errors();
        EXPECT_GT(live.size(), 500U);
        EXPECT_EQ(live, decoder.output());
        EXPECT_EQ(replayed, decoder.output());
    }
}

TEST_F(CaptureSession, FilesThatAreOfNoUseEndItAtTheStart)
{
    const QString capture = path("capture");
    QFile file(capture);
    ASSERT_TRUE(file.open(QIODevice::WriteOnly) && file.resize(1000));
    const struct {
        QStringList arguments;
        int status;
        const char* complaint;
    } cases[] = {
        {{"--replay", "/no/such/capture"}, 1, "koratd: /no/such/capture: No such file or directory\n"},
        {{"--replay", capture, "--loop"}, 1, "neither a pcap nor a DLF file\n"},
        {{"--record", "/no/such/folder/file"}, 1,
            "koratd: /no/such/folder/file: No such file or directory\n"},
        {{"--record", "/dev/full"}, 1, "koratd: /dev/full: No space left on device\n"},
        {{"--replay", capture, "--record", path("./capture")}, 2,
            "--record would overwrite the capture that is replayed"},
    };
    for (const auto& [arguments, status, complaint] : cases) {
        Program korat(folder, KORATD_PATH, arguments);
        EXPECT_EQ(korat.waitForEnd(), status);
        EXPECT_THAT(korat.errors(), HasSubstr(complaint));
    }
    EXPECT_EQ(file.size(), 1000);
}

TEST_F(CaptureSession, FullDiskEndsTheRecordingOnly)
{
    // A limit of the file's size stands for the disk.
    Program korat(folder, "/bin/sh",
        {"-c", R"(trap '' XFSZ; ulimit -f 16; exec "$0" "$@")", KORATD_PATH, "--rate", "2000", "--record",
            path("capture")});
    KoratClient client(folder.ports());
    ASSERT_TRUE(waitUntil([&] { return client.open() == 0; }));
    client.send(everything());
    ASSERT_TRUE(korat.waitForError("File too large; recording ends here"));
    const std::size_t before = client.messages.size();
    EXPECT_TRUE(waitUntil([&] { return client.messages.size() > before + 1000; }));
    EXPECT_EQ(korat.terminate(), 0);
    EXPECT_EQ(QString::fromStdString(korat.errors()).count("recording ends"), 1) << korat.errors();
    const auto captured = messagesIn(folder.path("capture"));
    ASSERT_GT(captured.size(), 10U);
    for (std::size_t i = 0; i < captured.size(); ++i)
        EXPECT_EQ(captured[i].message, client.messages.at(i));
}

} // namespace
} // namespace orvex::test
