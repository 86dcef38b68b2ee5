// koratd as a program, with clients inside the test.

#include "KoratClient.h"
#include "Programs.h"

#include "Array.h"

#include <gmock/gmock.h>

#include <csignal>
#include <filesystem>
#include <thread>

namespace orvex::test {
namespace {

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

TEST(KoratProcess, ASecondServiceFindsThePlaceTakenAndLeavesTheRecordingAlone)
{
    const ProgramFolder folder;
    KoratProgram first(folder, {"--record", folder.name("capture"), "--rate", "2000", "--count", "50"});
    KoratClient client(folder.ports());
    ASSERT_EQ(client.open(), 0);
    client.send();
    ASSERT_TRUE(waitUntil([&] { return client.messages.size() == 50; }));
    Program second(folder, KORATD_PATH, {"--record", folder.name("capture")});
    EXPECT_EQ(second.waitForEnd(), 1);
    EXPECT_THAT(second.errors(), HasSubstr("another service is running already"));
    EXPECT_EQ(first.terminateAndCount(), 50);
    EXPECT_GT(std::filesystem::file_size(folder.path("capture")), 50U * 16);
    EXPECT_EQ(KoratProgram(folder).terminateAndCount(), 0) << "nothing was left behind";
}

} // namespace
} // namespace orvex::test
