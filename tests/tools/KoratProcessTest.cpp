// koratd as a program, with clients inside the test.

#include "KoratClient.h"
#include "KoratProgram.h"

#include "Array.h"

#include <QFile>

#include <gmock/gmock.h>

#include <cerrno>

namespace orvex::test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::Key;
using testing::Not;

TEST(KoratProcess, WrongOptionsAndFilesOfNoUseEndItAtTheStart)
{
    const ProgramFolder folder;
    const QString capture = QString::fromStdString(folder.path("capture"));
    QFile file(capture);
    ASSERT_TRUE(file.open(QIODevice::WriteOnly) && file.resize(1000));
    const struct {
        const char* complaint;
        QStringList arguments;
        int status = 2;
    } cases[] = {
        {"Unknown technology 'MRL_NOISE'.", {"--technology", "MRL_NOISE"}},
        {"--rate takes a number", {"--rate", "0"}},
        {"--count takes a number", {"--count", "-1"}},
        {"--count is given more than once", {"--count", "1", "--count", "2"}},
        {"Unknown fault 'garbage=101'.", {"--fault", "garbage=101"}},
        {"Unknown fault 'die-after'.", {"--fault", "die-after"}},
        {"Unknown fault 'refuse-channel=0'.", {"--fault", "refuse-channel=0"}},
        {"Unknown fault 'null-port=1'.", {"--fault", "null-port=1"}},
        {"Unexpected argument 'town'.", {"town"}},
        {"koratd: /no/such/capture: No such file or directory\n", {"--capture", "/no/such/capture"}, 1},
        {"neither a pcap nor a DLF file\n", {"--capture", capture}, 1},
        {"koratd: /no/such/file: No such file or directory\n", {"--record", "/no/such/file"}, 1},
        {"koratd: /dev/full: No space left on device\n", {"--record", "/dev/full"}, 1},
    };
    for (const auto& [complaint, arguments, status] : cases) {
        Program korat(folder, KORATD_PATH, arguments);
        EXPECT_EQ(korat.waitForEnd(), status) << complaint;
        EXPECT_THAT(korat.errors(), HasSubstr(complaint));
        EXPECT_EQ(korat.errors().find("Try 'koratd --help'.") != std::string::npos, status == 2) << complaint;
    }

    const QString link = QString::fromStdString(folder.path("link"));
    ASSERT_TRUE(QFile::link(capture, link));
    Program overwriting(folder, KORATD_PATH, {"--capture", capture, "--record", link});
    EXPECT_EQ(overwriting.waitForEnd(), 2);
    EXPECT_EQ(overwriting.errors(),
        "koratd: --record " + link.toStdString() + " and --capture " + capture.toStdString()
            + " are the same file\n");
    EXPECT_EQ(file.size(), 1000);
    Program help(folder, KORATD_PATH, {"--help"});
    EXPECT_EQ(help.waitForEnd(), 0);
    EXPECT_THAT(help.output(), HasSubstr("--fault"));
}

TEST(KoratProcess, StreamsWhatWasAskedForAfterTheStartCommand)
{
    const ProgramFolder folder;
    KoratProgram korat(folder, {"--rate", "2000"});
    KoratClient client(folder.ports());
    ASSERT_EQ(client.open(), 0);
    EXPECT_EQ(client.technology(), Value("MRL_LTE"));
    client.send(Dictionary::make({{"SetState", "Idle"}}));
    turnFor(std::chrono::milliseconds(300));
    EXPECT_EQ(client.messages.size(), 0U);

    client.send(Dictionary::make({{"SetState", "Streaming"},
        {"SetMarlinLogCodes", Array::make({0xB17F, 0x4711})}, {"SetKoratExtraCodes", Array::make({1})}}));
    ASSERT_TRUE(waitUntil([&] { return client.codes().size() >= 2; }));
    client.send(Dictionary::make({{"SetState", "Streaming"}, {"SetMarlinLogCodes", Array::make({0xB179})},
        {"SetKoratExtraCodes", Array::make()}}));
    ASSERT_TRUE(waitUntil([&] { return client.codes().contains(0xB179); }));
    EXPECT_THAT(client.codes(), ElementsAre(Key(0xB179U), Key(0xB17FU), Key(0xFF0001U)));

    client.send();
    EXPECT_TRUE(waitUntil([&] { return client.codes().size() == 9; }));
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
    const auto frozen = korat.freezeFor(std::chrono::milliseconds(100));
    first.reset();
    ASSERT_EQ(second.open(), 0);
    EXPECT_EQ(second.technology(), Value("MRL_LTE"));
    EXPECT_TRUE(korat.waitForError("org.orvex.Test.Client has left; sent 1 messages"));
}

TEST(KoratProcess, RefusesChannelsToItselfAndToNamesThatAreNone)
{
    const ProgramFolder folder;
    KoratProgram korat(folder);
    const std::pair<std::string, long> cases[] = {
        {"org.orvex.Korat", EINVAL},
        {"org.orvex.Korat.LogChannel.1", EINVAL},
        {"", ENOENT},
        {"..", ENOENT},
        {"../elsewhere", ENOENT},
        {std::string(200, 'x'), ENOENT},
        {"\x1b[2J", ENOENT},
    };
    for (const auto& [name, error] : cases)
        EXPECT_EQ(KoratClient(folder.ports(), name).open(), error) << name;
    EXPECT_EQ(KoratClient(folder.ports()).open(), 0);
    korat.terminateAndCount();
    EXPECT_THAT(korat.errors(), Not(HasSubstr("\x1b")));
}

TEST(KoratProcess, ASecondServiceFindsThePlaceTakenAndLeavesTheRecordingAlone)
{
    const ProgramFolder folder;
    const QString capture = QString::fromStdString(folder.path("capture"));
    KoratProgram first(folder, {"--record", capture, "--rate", "2000", "--count", "50"});
    KoratClient client(folder.ports());
    ASSERT_EQ(client.open(), 0);
    client.send();
    ASSERT_TRUE(waitUntil([&] { return client.messages.size() == 50; }));
    Program second(folder, KORATD_PATH, {"--record", capture});
    EXPECT_EQ(second.waitForEnd(), 1);
    EXPECT_THAT(second.errors(), HasSubstr("another service is running already"));
    EXPECT_EQ(first.terminateAndCount(), 50);
    EXPECT_GT(QFile(capture).size(), 50 * 16);
    KoratProgram third(folder); // nothing was left behind
    EXPECT_EQ(third.terminateAndCount(), 0);
}

} // namespace
} // namespace orvex::test
