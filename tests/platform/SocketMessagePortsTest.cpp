// Message ports, their directory, and the telephony service behind one.

#include "KoratTelephonyService.h"
#include "TelephonyConstants.h"

#include "Environment.h"
#include "PortTest.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>

namespace orvex::test {
namespace {

using namespace std::literals;
using namespace testing;

using Status = RemotePort::Status;

class SocketMessagePortsTest : public PortTest { };

TEST_F(SocketMessagePortsTest, AMessageInPiecesDoesNotHoldUpOtherPeers)
{
    const auto local = ports.createLocalPort("a", [&](std::int32_t messageId, ByteView data) {
        collector()(messageId, data);
        return Bytes{0xFF};
    });
    RawPeer slow(pathOf("a"));
    RawPeer other(pathOf("a"));
    const Bytes bytes = {
        3, 0, 0, 0, 0xFE, 0xFF, 0xFF, 0xFF, 1, 0, 0, 0, 4, 3, 2, 0x81, 'a', 'b', 'c', // request -2
        6, 0, 0, 0, 1, 0, 0, 0, 2, 0, 0, 0, 9, 0, 0, 0, 'n', 'o', 'b', 'o', 'd', 'y', // a reply to nothing
        0, 0, 0, 0, 4, 3, 2, 1, 0, 0, 0, 0, 0, 0, 0, 0,                               // one-way, empty
    };
    std::string expected;
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        slow.send({bytes[i]});
        expected += i == 18 ? "-2:abc " : i == 56 ? "16909060: " : "";
        ASSERT_TRUE(receives(expected)) << received;
        other.say(2, "quick");
        expected += "2:quick ";
        ASSERT_TRUE(receives(expected)) << received;
    }
    EXPECT_EQ(slow.readAll(), QByteArray("\1\0\0\0\xFE\xFF\xFF\xFF\2\0\0\0\4\3\2\x81\xFF", 17));
}

TEST_F(SocketMessagePortsTest, RequestsGetTheirOwnReplies)
{
    std::optional<ServedPort> service;
    service.emplace(directory(), "a", [](std::int32_t messageId, ByteView data) -> std::optional<Bytes> {
        if (messageId == 1)
            std::this_thread::sleep_for(300ms);
        if (messageId == 2)
            return std::nullopt;
        Bytes reply(data.begin(), data.end());
        reply.push_back('!');
        return reply;
    });
    const auto remote = ports.createRemotePort("a");
    EXPECT_FALSE(remote->request(1, bytesOf("late"), 1s, 50ms).reply);
    // Slow as well, so that the late reply comes first.
    EXPECT_EQ(remote->request(1, bytesOf("after late"), 1s, 5s).reply, bytesOf("after late!"));
    const auto none = remote->request(2, bytesOf("none"), 1s, 50ms);
    EXPECT_EQ(none.status, Status::success);
    EXPECT_FALSE(none.reply);

    const std::string large(kLargestPayload - 1, 'x');
    EXPECT_TRUE(remote->request(0, bytesOf(large), 5s, 20s).reply == bytesOf(large + '!'));
    EXPECT_EQ(remote->send(0, bytesOf(large + "xx"), 5s), Status::transportError);
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("too long")));

    service.reset();
    EXPECT_FALSE(remote->request(0, bytesOf("x"), 1s, 20s).reply);
    EXPECT_EQ(remote->send(0, bytesOf("x"), 1s), Status::invalid);
}

TEST_F(SocketMessagePortsTest, ANameIsServedOnce)
{
    EXPECT_FALSE(ports.createRemotePort("a"));
    auto first = ports.createLocalPort("a", collector()).port;
    const auto second = ports.createLocalPort("a", {});
    EXPECT_TRUE(second.alreadyExisted);
    EXPECT_FALSE(second.port->isValid());
    second.port->invalidate();
    ASSERT_EQ(ports.createRemotePort("a")->send(7, bytesOf("x"), 1s), Status::success);
    EXPECT_TRUE(receives("7:x "));

    int invalidations = 0;
    first->setInvalidationCallback([&] {
        ++invalidations;
        first.reset();
    });
    const auto held = first.get();
    held->invalidate();
    EXPECT_EQ(invalidations, 1);
    EXPECT_NE(access(pathOf("a").c_str(), F_OK), 0) << "the socket file stayed";
    EXPECT_TRUE(ports.createLocalPort("a", collector()).port->isValid());
    EXPECT_THAT(log.take(), IsEmpty());
}

TEST_F(SocketMessagePortsTest, AStarterTakesOverAStaleSocketOnceItHasTheDirectory)
{
    // A link to its socket outlives port b, and nobody listens there.
    ASSERT_TRUE(
        ports.createLocalPort("b", collector()).port && link(pathOf("b").c_str(), pathOf("a").c_str()) == 0);
    auto lock = PortDirectory(directory()).lock();
    std::atomic<bool> isServed = false;
    std::jthread starter([&] {
        const QEventLoop loop;
        isServed = ports.createLocalPort("a", collector()).port->isValid();
    });
    std::this_thread::sleep_for(50ms);
    EXPECT_FALSE(isServed) << "another one held the directory";
    lock.reset();
    starter.join();
    EXPECT_TRUE(isServed);

    std::ofstream(pathOf("file")) << "not a socket";
    EXPECT_FALSE(ports.createLocalPort("file", collector()).port);
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("Message port file: Address already in use")));
    EXPECT_EQ(access(pathOf("file").c_str(), F_OK), 0) << "somebody's file was removed";
}

TEST_F(SocketMessagePortsTest, SendingWaitsForAPeerThatDoesNotReadAndLosesNothing)
{
    const auto dataOf = [](std::int32_t i) {
        return Bytes(i % 2 ? 7 : 1 << 20, static_cast<std::uint8_t>(i)); // short and long ones
    };
    std::int32_t arrived = 0;
    const auto local = ports.createLocalPort("a", [&](std::int32_t messageId, ByteView data) {
        EXPECT_EQ(messageId, arrived);
        EXPECT_TRUE(std::ranges::equal(data, dataOf(arrived))) << arrived;
        ++arrived;
        return std::nullopt;
    });
    const auto remote = ports.createRemotePort("a");
    std::int32_t accepted = 0; // while the event loop stands still, the port reads nothing
    while (remote->send(accepted, dataOf(accepted), 0ms) == Status::success)
        ASSERT_LT(++accepted, 64);
    EXPECT_GT(remote->pendingBytes(), std::size_t{8} << 20);
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(remote->send(accepted, {}, 100ms), Status::sendTimeout);
    EXPECT_GE(std::chrono::steady_clock::now() - start, 100ms);
    EXPECT_TRUE(waitUntil([&] { return arrived >= accepted; }));
    turnFor(20ms);
    EXPECT_EQ(remote->pendingBytes(), 0U);
    EXPECT_EQ(arrived, accepted) << "a message that was not accepted must not arrive";
}

TEST_F(SocketMessagePortsTest, WaitingMessagesAreDeliveredWithoutTheEventLoop)
{
    std::shared_ptr<LocalPort> port = ports
                                          .createLocalPort("a",
                                              [&](std::int32_t messageId, ByteView data) {
                                                  if (messageId == 0)
                                                      port->invalidate();
                                                  return collector()(messageId, data);
                                              })
                                          .port;
    std::optional<RawPeer> gone(pathOf("a"));
    RawPeer last(pathOf("a"));
    last.say(9, "here");
    ASSERT_TRUE(receives("9:here ")); // the port knows both

    std::string expected = received;
    for (int i = 1; i <= 150; ++i) { // more than one turn takes
        gone->say(i, "x");
        expected += std::to_string(i) + ":x ";
    }
    gone.reset();
    last.say(7, "y");
    last.send({1, 0, 0}); // the beginning of the next
    port->deliverWaiting();
    EXPECT_EQ(received, expected + "7:y ");
    last.send({0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 'e'}); // closes the port
    last.say(8, "z");
    port->deliverWaiting();
    EXPECT_EQ(received, expected + "7:y 0:e ");
    EXPECT_FALSE(port->isValid());
}

TEST_F(SocketMessagePortsTest, ReceiverMayInvalidateOrDestroyItsPort)
{
    for (const bool destroys : {false, true}) {
        std::shared_ptr<LocalPort> local;
        int messages = 0;
        const auto receiver = [&, marker = Bytes(100, 'm')](auto, ByteView data) {
            ++messages;
            destroys ? local.reset() : local->invalidate();
            // The message and the receiver itself outlive the call.
            EXPECT_EQ(data[2], 'e');
            EXPECT_EQ(marker, Bytes(100, 'm'));
            return Bytes{1};
        };
        local = ports.createLocalPort("a", receiver).port;
        RawPeer peer(pathOf("a"));
        peer.say(0, "bye");
        peer.say(0, "bye");
        EXPECT_TRUE(waitUntil([&] { return peer.isClosedByOther(); }));
        EXPECT_EQ(messages, 1);
        EXPECT_NE(access(pathOf("a").c_str(), F_OK), 0);
    }
}

TEST_F(SocketMessagePortsTest, DirectoryIsTheOwnersAlone)
{
    ASSERT_TRUE(PortDirectory(directory()).isUsable());
    EXPECT_EQ(std::filesystem::status(directory()).permissions(), std::filesystem::perms::owner_all);
    const std::pair<const char*, std::string> cases[] = {
        // why, and what makes the directory
        {"open to other users", "mkdir -m 770 "},
        {"open to other users", "mkdir -m 701 "},
        {"symbolic link", "ln -s /tmp "},
        {"not a directory", "touch "},
        {"another user", "install -d -m 700 -o 65534 "},
    };
    for (const auto& [reason, command] : cases) {
        const auto shell = "rm -rf " + directory() + " && " + command + directory();
        // Only root can give a directory away.
        if (std::system(shell.c_str()) != 0 && geteuid() != 0) // NOLINT(cert-env33-c,concurrency-mt-unsafe)
            continue;
        EXPECT_FALSE(ports.createLocalPort("a", collector()).port) << command;
        EXPECT_FALSE(ports.createRemotePort("a")) << command;
        EXPECT_THAT(log.take(), AllOf(SizeIs(2), Each(HasSubstr(reason)))) << command;
    }
    EXPECT_FALSE(SocketMessagePorts(directory() + "/no/where").createRemotePort("a"));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("No such file")));
}

TEST_F(SocketMessagePortsTest, NamesThatLeadElsewhereAreRefused)
{
    for (const std::string& name : {""s, "."s, ".."s, "a/b"s, "a\0b"s, std::string(108, 'x')}) {
        EXPECT_FALSE(ports.createLocalPort(name, collector()).port) << name;
        EXPECT_FALSE(ports.createRemotePort(name)) << name;
        EXPECT_THAT(log.take(), SizeIs(2)) << name;
    }
}

TEST_F(SocketMessagePortsTest, EnvironmentNamesTheDirectory)
{
    setEnvironment("XDG_RUNTIME_DIR", "/run/user/7");
    for (const auto& [name, path] : {std::pair("/chosen", "/chosen"), {"", "/run/user/7/orvex"}}) {
        setEnvironment("ORVEX_PORT_DIR", name);
        EXPECT_EQ(PortDirectory().path(), path);
    }
    setEnvironment("XDG_RUNTIME_DIR", nullptr);
    EXPECT_EQ(PortDirectory().path(), "/tmp/orvex-" + std::to_string(geteuid()));
}

TEST_F(SocketMessagePortsTest, TelephonyServiceSaysWhyThereIsNoChannel)
{
    KoratTelephonyService telephony(ports);
    EXPECT_FALSE(telephony.connect({})) << "nobody is there";
    const std::pair<std::string, long> cases[] = {{"", ETIMEDOUT}, {"huh", EPROTO}, {"<array/>", EPROTO},
        {"<dict><key>ErrorCode</key><string>0</string></dict>", EPROTO}};
    for (const auto& [reply, code] : cases) {
        const ServedPort service(directory(), telephony::kServicePortName, [&reply = reply](auto, auto) {
            return reply.empty() ? std::nullopt : std::optional(bytesOf(xmlList(reply)));
        });
        const auto answer = telephony.connect({})->createNetworkMonitorLogChannel("my.port");
        EXPECT_EQ(answer.errorCode, code) << reply;
        EXPECT_FALSE(answer.remotePortName) << reply;
        EXPECT_THAT(log.take(), ElementsAre(HasSubstr(code == EPROTO ? "its reply" : "no reply in time")));
    }
}

} // namespace
} // namespace orvex::test
