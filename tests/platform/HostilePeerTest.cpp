#include "PortTest.h"
#include "QtRunLoop.h"

#include <sys/fsuid.h>
#include <sys/wait.h>

namespace orvex {
namespace {

using namespace std::chrono_literals;
using test::RawPeer;
using test::turnFor;
using test::viewOf;
using test::waitUntil;
using testing::ElementsAre;
using testing::HasSubstr;

class HostilePeerTest : public test::PortTest { };

TEST_F(HostilePeerTest, NonsenseClosesThatConnectionAlone)
{
    const auto local = ports.createLocalPort("a", collector());
    RawPeer good;
    ASSERT_TRUE(good.connectTo(pathOf("a")));
    const struct {
        Bytes bytes;
        const char* reason;
    } cases[] = {
        {{1, 0, 0, 1, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}, "more than 16 MiB"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 9, 0, 0, 0, 0, 0, 0, 0}, "unknown kind"},
    };
    for (const auto& test : cases) {
        RawPeer bad;
        ASSERT_TRUE(bad.connectTo(pathOf("a")));
        ASSERT_TRUE(bad.write({1, FrameKind::oneWay, 0, viewOf("before")}));
        ASSERT_TRUE(bad.write(test.bytes));
        EXPECT_TRUE(waitUntil([&] { return bad.isClosedByOther(); })) << test.reason;
        EXPECT_THAT(log.take(), ElementsAre(HasSubstr(test.reason)));
        ASSERT_TRUE(good.write({2, FrameKind::oneWay, 0, viewOf("good")}));
        EXPECT_TRUE(waitUntil([&] { return received == "1:before 2:good "; })) << received;
        received.clear();
    }
}

TEST_F(HostilePeerTest, PeerThatVanishesLeavesNothingBehind)
{
    const auto local = ports.createLocalPort("a", collector());
    RawPeer vanishing;
    ASSERT_TRUE(vanishing.connectTo(pathOf("a")));
    for (int i = 0; i < 300; ++i)
        ASSERT_TRUE(vanishing.write({i, FrameKind::request, 1, viewOf("x")}));
    ASSERT_TRUE(vanishing.write(Bytes{9, 0, 0, 0, 1}));
    vanishing.leave();
    EXPECT_TRUE(waitUntil([&] { return !log.lines.empty(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("inside a message")));
    EXPECT_THAT(received, HasSubstr("299:x ")) << "what was sent before still counts";
}

TEST_F(HostilePeerTest, NumberOfPeersIsBounded)
{
    const auto local = ports.createLocalPort("a", collector());
    std::vector<std::unique_ptr<RawPeer>> peers;
    for (int i = 0; i < 64; ++i) {
        peers.push_back(std::make_unique<RawPeer>());
        ASSERT_TRUE(peers.back()->connectTo(pathOf("a")));
        turnFor(1ms);
    }
    RawPeer refused;
    ASSERT_TRUE(refused.connectTo(pathOf("a")));
    EXPECT_TRUE(waitUntil([&] { return refused.isClosedByOther(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("64 are connected")));
    peers.pop_back();
    turnFor(20ms);
    RawPeer next;
    ASSERT_TRUE(next.connectTo(pathOf("a")));
    ASSERT_TRUE(next.write({1, FrameKind::oneWay, 0, viewOf("next")}));
    EXPECT_TRUE(waitUntil([&] { return received == "1:next "; })) << "the place of the one that left is free";
}

TEST_F(HostilePeerTest, FloodLeavesTheEventLoopItsTurns)
{
    int inOneTurn = 0;
    int most = 0;
    int all = 0;
    const auto local = ports.createLocalPort("a", [&](auto, auto) {
        ++all;
        most = std::max(most, ++inOneTurn);
        std::this_thread::sleep_for(50us); // work enough for the timer to be due at the next turn
        return std::nullopt;
    });
    RawPeer peer;
    ASSERT_TRUE(peer.connectTo(pathOf("a")));
    Bytes flood;
    const Bytes frame = encodedFrame({0, FrameKind::oneWay, 0, viewOf("x")});
    for (int i = 0; i < 5000; ++i)
        flood.insert(flood.end(), frame.begin(), frame.end());
    QtRunLoop loop;
    const auto timer = loop.startTimer(1ms, [&] { inOneTurn = 0; });
    ASSERT_TRUE(peer.write(flood));
    EXPECT_TRUE(waitUntil([&] { return all == 5000; }));
    EXPECT_LE(most, 64);
}

TEST_F(HostilePeerTest, PeerThatDoesNotTakeItsRepliesIsNotServedFurther)
{
    int asked = 0;
    const auto local = ports.createLocalPort("a", [&](auto, auto) {
        ++asked;
        return Bytes(100'000);
    });
    RawPeer peer;
    ASSERT_TRUE(peer.connectTo(pathOf("a")));
    for (int i = 0; i < 200; ++i)
        ASSERT_TRUE(peer.write({0, FrameKind::request, 1, {}}));
    turnFor(100ms);
    EXPECT_LT(asked, 50);
    std::size_t bytes = 0;
    EXPECT_TRUE(waitUntil([&] {
        bytes += peer.read().size();
        return bytes == 200 * (100'000 + kFrameHeaderSize);
    }));
    EXPECT_EQ(asked, 200);
}

TEST_F(HostilePeerTest, ReceiverMayInvalidateOrDestroyItsPort)
{
    for (const bool destroys : {false, true}) {
        std::shared_ptr<LocalPort> local;
        int messages = 0;
        local = ports
                    .createLocalPort("a",
                        [&, marker = std::string(100, 'm')](auto, ByteView data) {
                            ++messages;
                            destroys ? local.reset() : local->invalidate();
                            // The message and the receiver itself last to the end of the call.
                            EXPECT_EQ(std::string(data.begin(), data.end()) + marker,
                                "bye" + std::string(100, 'm'));
                            return Bytes{1};
                        })
                    .port;
        RawPeer peer;
        ASSERT_TRUE(peer.connectTo(pathOf("a")));
        ASSERT_TRUE(peer.write({0, FrameKind::request, 1, viewOf("bye")}));
        ASSERT_TRUE(peer.write({0, FrameKind::request, 2, viewOf("bye")}));
        EXPECT_TRUE(waitUntil([&] { return peer.isClosedByOther(); }));
        EXPECT_EQ(messages, 1);
        EXPECT_NE(access(pathOf("a").c_str(), F_OK), 0);
    }
}

TEST_F(HostilePeerTest, PeerOfAnotherUserIsRefused)
{
    if (geteuid() != 0)
        GTEST_SKIP() << "only root can become another user";
    const auto local = ports.createLocalPort("a", collector());
    const auto path = pathOf("a");
    const pid_t child = fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
        // The user of the process is another one; only its access to files is still that of root, as the
        // closed directory would keep it out before.
        constexpr uid_t kNobody = 65534;
        RawPeer peer;
        if (setresuid(kNobody, kNobody, 0) != 0)
            _exit(2);
        setfsuid(0);
        if (!peer.connectTo(path))
            _exit(3);
        peer.write({1, FrameKind::oneWay, 0, viewOf("let me in")});
        for (int i = 0; i < 1000 && !peer.isClosedByOther(); ++i)
            usleep(10'000);
        _exit(peer.isClosedByOther() ? 0 : 4);
    }
    int status = -1;
    EXPECT_TRUE(waitUntil([&] { return waitpid(child, &status, WNOHANG) == child; }, 20s));
    EXPECT_EQ(status, 0);
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("a peer of user 65534 was refused")));
    EXPECT_EQ(received, "");
}

} // namespace
} // namespace orvex
