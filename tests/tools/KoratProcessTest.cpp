// koratd as a program, with clients inside the test.

#include "Captures.h"
#include "KoratClient.h"
#include "Programs.h"

#include "Array.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <csignal>
#include <thread>

namespace orvex::test {
namespace {

using namespace std::chrono_literals;
using testing::HasSubstr;

TEST(KoratProcess, StreamsWhatWasAskedForAfterTheStartCommand)
{
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--rate", "2000"});
    KoratClient client(folder.ports());
    ASSERT_EQ(client.open(), 0);
    client.send(Dictionary::make({{"SetState", "Idle"}}));
    turnFor(std::chrono::milliseconds(300));
    EXPECT_EQ(client.messages.size(), 0U);

    client.send(Dictionary::make({{"SetState", "Streaming"}, {"SetMarlinLogCodes", Array::make({0xB17F})}}));
    ASSERT_TRUE(waitUntil([&] { return client.messages.size() > 9; }));
    for (const Bytes& message : client.messages)
        EXPECT_EQ(message.at(3) | message.at(4) << 8, 0xB17F);
    client.send(); // another start
    EXPECT_TRUE(waitUntil([&] { return client.messages.back().at(0) == 255; }));
}

TEST(KoratProcess, ServesOneClientAtATime)
{
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--count", "1"});
    auto first = std::make_unique<KoratClient>(folder.ports());
    KoratClient second(folder.ports(), "org.orvex.Test.Second");
    ASSERT_EQ(first->open(), 0);
    EXPECT_EQ(second.open(), EBUSY);
    first->send();
    ASSERT_TRUE(waitUntil([&] { return !first->messages.empty(); }));

    // koratd finds the request before it has looked whether the first client is still there.
    const pid_t id = korat.id();
    ::kill(id, SIGSTOP);
    const std::jthread waker([id] {
        std::this_thread::sleep_for(std::chrono::milliseconds(100));
        ::kill(id, SIGCONT);
    });
    first.reset();
    ASSERT_EQ(second.open(), 0);
    EXPECT_EQ(second.technology(), Value("MRL_LTE"));
    EXPECT_TRUE(korat.waitFor("org.orvex.Test.Client has left; sent 1 messages"));
}

TEST(KoratProcess, RefusesChannelsToItselfAndToNamesThatAreNone)
{
    const ProgramFolder folder;
    KoratProgram korat(folder);
    const std::pair<std::string, long> cases[] = {
        {"org.orvex.Korat", EINVAL},
        {"org.orvex.Korat.LogChannel.1", EINVAL},
        {"../elsewhere", ENOENT},
        {std::string(200, 'x'), ENOENT},
        {"\x1b[2J", ENOENT},
    };
    for (const auto& [name, error] : cases)
        EXPECT_EQ(KoratClient(folder.ports(), name).open(), error) << name;
    EXPECT_EQ(KoratClient(folder.ports()).open(), 0);
    EXPECT_EQ(korat.terminateAndCount(), 0);
    EXPECT_THAT(korat.errors(), testing::Not(HasSubstr("\x1b")));
}

using Captured = std::pair<std::chrono::microseconds, Bytes>; // since the first message

std::vector<Captured> messagesIn(const std::string& path)
{
    std::vector<Captured> result;
    const auto reader = CaptureReader::open(path);
    std::optional<std::chrono::microseconds> start;
    while (reader->next() == CaptureReader::Status::message) {
        start = start.value_or(reader->time());
        result.emplace_back(
            reader->time() - *start, Bytes(reader->message().begin(), reader->message().end()));
    }
    return result;
}

TEST(KoratProcess, RecordedPlayedAndRecordedAgainItIsTheSame)
{
    const ProgramFolder folder;
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
        const auto first = messagesIn(folder.path("first"));
        ASSERT_EQ(first.size(), kCount);
        EXPECT_TRUE(std::ranges::equal(first, received, {}, &Captured::second));
        EXPECT_TRUE(first == messagesIn(folder.path("second")));
        // Messages stand at the capture's times, however fast they went.
        EXPECT_GT(first.back().first, 20s);
        EXPECT_TRUE(std::ranges::is_sorted(first, {}, &Captured::first));
    }
}

} // namespace
} // namespace orvex::test
