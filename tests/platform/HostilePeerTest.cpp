#include "PortTest.h"
#include "QtRunLoop.h"

#include <deque>

#include <sys/fsuid.h>

namespace orvex {
namespace {

using namespace std::chrono_literals;
using test::bytesOf;
using test::RawPeer;
using test::turnFor;
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
        {{0xFF, 0xFF, 0xFF, 0xFF, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}, "more than 16 MiB"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 3, 0, 0, 0, 0, 0, 0, 0}, "unknown kind"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0}, "unknown kind"},
    };
    for (const auto& test : cases) {
        RawPeer bad;
        ASSERT_TRUE(bad.connectTo(pathOf("a")));
        ASSERT_TRUE(bad.write({1, FrameKind::oneWay, 0, bytesOf("before")}));
        ASSERT_TRUE(bad.write(test.bytes));
        EXPECT_TRUE(waitUntil([&] { return bad.isClosedByOther(); })) << test.reason;
        EXPECT_THAT(log.take(), ElementsAre(HasSubstr(test.reason)));
        ASSERT_TRUE(good.write({2, FrameKind::oneWay, 0, bytesOf("good")}));
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
        ASSERT_TRUE(vanishing.write({i, FrameKind::request, 1, bytesOf("x")}));
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
    const auto connect = [&](const char* word) {
        peers.push_back(std::make_unique<RawPeer>());
        ASSERT_TRUE(peers.back()->connectTo(pathOf("a")));
        ASSERT_TRUE(peers.back()->write({1, FrameKind::oneWay, 0, bytesOf(word)}));
        turnFor(1ms);
    };
    for (int i = 0; i < 64; ++i)
        connect("x");
    EXPECT_TRUE(waitUntil([&] { return received.size() == 256; }));
    received.clear();
    connect("one too many");
    EXPECT_TRUE(waitUntil([&] { return peers.back()->isClosedByOther(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("a peer was refused, 64 are connected")));
    peers.erase(peers.begin());
    turnFor(20ms);
    connect("next");
    EXPECT_TRUE(waitUntil([&] { return received == "1:next "; })) << "the place of the one that left is free";
}

TEST_F(HostilePeerTest, SilentPeersDoNotKeepOthersOut)
{
    const auto local = ports.createLocalPort("a", collector());
    RawPeer real;
    ASSERT_TRUE(real.connectTo(pathOf("a")));
    ASSERT_TRUE(real.write({1, FrameKind::oneWay, 0, bytesOf("here")}));
    RawPeer slow; // a byte now and then
    ASSERT_TRUE(slow.connectTo(pathOf("a")));
    const Bytes frame = encodedFrame({2, FrameKind::oneWay, 0, bytesOf("slow")});
    ASSERT_TRUE(slow.write(ByteView(frame).first(frame.size() - 1)));
    EXPECT_TRUE(waitUntil([&] { return received == "1:here "; }));

    std::deque<RawPeer> silent;
    for (int i = 0; i < 10'000; ++i) {
        silent.emplace_back();
        ASSERT_TRUE(silent.back().connectTo(pathOf("a")));
        QCoreApplication::processEvents();
        if (silent.size() > 200)
            silent.pop_front(); // the test has its limits too
        if (i % 1000 == 0) {
            ASSERT_TRUE(real.write({1, FrameKind::oneWay, 0, bytesOf("on")}));
        }
    }
    EXPECT_TRUE(slow.isClosedByOther());
    RawPeer late;
    ASSERT_TRUE(late.connectTo(pathOf("a")));
    ASSERT_TRUE(late.write({3, FrameKind::oneWay, 0, bytesOf("late")}));
    EXPECT_TRUE(waitUntil([&] { return received.ends_with("3:late "); })) << received;
    EXPECT_EQ(received.size(), 7U + 10 * 5 + 7);
    EXPECT_THAT(log.take(), testing::Each(HasSubstr("a silent peer was closed, 64 are connected")));
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
    const Bytes frame = encodedFrame({0, FrameKind::oneWay, 0, bytesOf("x")});
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
        const auto receiver = [&, marker = Bytes(100, 'm')](auto, ByteView data) {
            ++messages;
            destroys ? local.reset() : local->invalidate();
            // The message and the receiver itself last to the end of the call.
            EXPECT_EQ(data[2], 'e');
            EXPECT_EQ(marker, Bytes(100, 'm'));
            return Bytes{1};
        };
        local = ports.createLocalPort("a", receiver).port;
        RawPeer peer;
        ASSERT_TRUE(peer.connectTo(pathOf("a")));
        ASSERT_TRUE(peer.write({0, FrameKind::request, 1, bytesOf("bye")}));
        ASSERT_TRUE(peer.write({0, FrameKind::request, 2, bytesOf("bye")}));
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
    // The user of the process is another one; only its access to files is still that of root, as the closed
    // directory would keep it out before.
    constexpr uid_t kNobody = 65534;
    RawPeer peer;
    ASSERT_EQ(seteuid(kNobody), 0);
    setfsuid(0);
    const bool isConnected = peer.connectTo(pathOf("a"));
    ASSERT_EQ(seteuid(0), 0);
    ASSERT_TRUE(isConnected && peer.write({1, FrameKind::oneWay, 0, bytesOf("let me in")}));
    EXPECT_TRUE(waitUntil([&] { return peer.isClosedByOther(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("a peer of user 65534 was refused")));
    EXPECT_EQ(received, "");
}

} // namespace
} // namespace orvex
