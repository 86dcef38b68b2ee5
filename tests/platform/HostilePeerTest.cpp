#include "PortTest.h"
#include "QtRunLoop.h"

#include <deque>

#include <sys/fsuid.h>
#include <sys/resource.h>

namespace orvex::test {
namespace {

using namespace std::literals;
using namespace testing;

class HostilePeerTest : public PortTest { };

TEST_F(HostilePeerTest, NonsenseClosesOnlyItsOwnConnection)
{
    const auto local = ports.createLocalPort("a", collector());
    RawPeer good(pathOf("a"));
    const std::pair<Bytes, const char*> cases[] = {
        {{1, 0, 0, 1, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}, "more than 16 MiB"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 3, 0, 0, 0, 0, 0, 0, 0}, "unknown kind"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0}, "unknown kind"},
    };
    for (const auto& [bytes, reason] : cases) {
        RawPeer bad(pathOf("a"));
        bad.say(1, "before");
        bad.send(bytes);
        EXPECT_TRUE(waitUntil([&] { return bad.isClosedByOther(); })) << reason;
        EXPECT_THAT(log.take(), ElementsAre(HasSubstr(reason)));
        good.say(2, "good");
        EXPECT_TRUE(receives("1:before 2:good ")) << received;
        received.clear();
    }
    {
        RawPeer vanishing(pathOf("a"));
        for (int i = 0; i < 200; ++i) // as the socket holds
            vanishing.send(encodedFrame({i, FrameKind::request, 1, {}}));
        vanishing.send({9, 0, 0, 0, 1});
    }
    EXPECT_TRUE(waitUntil([&] { return !log.lines.empty(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("inside a message")));
    EXPECT_THAT(received, HasSubstr("199: ")) << "messages sent before it left count";
}

TEST_F(HostilePeerTest, IdlePeersMakeRoomAndActiveOnesDoNot)
{
    const auto local = ports.createLocalPort("a", collector());
    RawPeer silent(pathOf("a"));
    silent.send(Bytes(kFrameHeaderSize - 1)); // part of a message does not count
    std::deque<RawPeer> active;
    for (int i = 0; i < 16; ++i) {
        active.emplace_back(pathOf("a")).say(1, "x");
        turnFor(1ms);
    }
    ASSERT_TRUE(waitUntil([&] { return received.size() == 16 * 4 && silent.isClosedByOther(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("an idle peer was closed, 16 are connected")));
    RawPeer refused(pathOf("a"));
    EXPECT_TRUE(waitUntil([&] { return refused.isClosedByOther(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("a peer was refused, 16 are connected")));

    turnFor(1100ms);
    active.front().say(1, "on");
    turnFor(10ms);
    received.clear();
    RawPeer late(pathOf("a"));
    late.say(1, "late");
    EXPECT_TRUE(receives("1:late ")) << received;
    EXPECT_TRUE(active[1].isClosedByOther()) << "it has been idle for longest";
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("an idle peer was closed, 16 are connected")));
    active.pop_back(); // leaves of its own accord
    turnFor(20ms);
    RawPeer next(pathOf("a"));
    next.say(1, "next");
    EXPECT_TRUE(receives("1:late 1:next ")) << received;
    EXPECT_THAT(log.take(), ElementsAre()) << "nobody is closed for it";
}

TEST_F(HostilePeerTest, PartialMessagesAreBoundedInTotal)
{
    const auto local = ports.createLocalPort("a", collector());
    const Bytes most = encodedFrame({1, FrameKind::oneWay, 0, Bytes(kLargestPayload)});
    std::deque<RawPeer> peers;
    for (int i = 0; i < 4; ++i) {
        peers.emplace_back(pathOf("a")).send(Bytes(most.begin(), most.end() - 100));
        turnFor(20ms);
    }
    EXPECT_TRUE(log.take().empty());
    RawPeer honest(pathOf("a"));
    honest.send(most);
    EXPECT_TRUE(waitUntil([&] { return received.size() == kLargestPayload + 3; })) << received.size();
    EXPECT_TRUE(peers[0].isClosedByOther());
    EXPECT_FALSE(peers[1].isClosedByOther());
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("a peer inside a message was closed")));
}

TEST_F(HostilePeerTest, PortListensAgainOnceThereAreDescriptors)
{
    const auto local = ports.createLocalPort("a", collector());
    // The sanitizers take descriptors when they first look at an object.
    RawPeer(pathOf("a")).say(1, "early");
    ASSERT_TRUE(receives("1:early "));
    turnFor(50ms); // it has gone
    systemLog(Priority::error, "early");
    log.take();
    std::deque<int> descriptors;
    rlimit limit{};
    getrlimit(RLIMIT_NOFILE, &limit);
    const rlimit few{200, limit.rlim_max};
    setrlimit(RLIMIT_NOFILE, &few);
    for (int i = dup(0); i >= 0; i = dup(0))
        descriptors.push_back(i);
    close(descriptors.back()); // for the peer's own end
    descriptors.pop_back();
    RawPeer peer(pathOf("a"));
    peer.say(1, "here");
    EXPECT_TRUE(waitUntil([&] { return !log.lines.empty(); }));
    turnFor(700ms); // the next attempt fails too
    for (const int descriptor : descriptors)
        close(descriptor);
    setrlimit(RLIMIT_NOFILE, &limit);
    EXPECT_TRUE(receives("1:early 1:here "));
    EXPECT_THAT(
        log.take(), ElementsAre(HasSubstr("Too many open files"), HasSubstr("accepting peers again")));
}

TEST_F(HostilePeerTest, FloodLeavesTheEventLoopItsTurns)
{
    int inOneTurn = 0;
    int most = 0;
    int all = 0;
    const auto local = ports.createLocalPort("a", [&](auto, auto) {
        ++all;
        most = std::max(most, ++inOneTurn);
        std::this_thread::sleep_for(50us); // 64 of these take longer than the timer's period
        return std::nullopt;
    });
    RawPeer peer(pathOf("a"));
    QtRunLoop loop;
    const auto timer = loop.startTimer(1ms, [&] { inOneTurn = 0; });
    peer.send(Bytes(5000 * kFrameHeaderSize)); // empty messages
    EXPECT_TRUE(waitUntil([&] { return all == 5000; }));
    EXPECT_LE(most, 64);
}

TEST_F(HostilePeerTest, PeerThatDoesNotReadItsRepliesWaits)
{
    constexpr qint64 kReply = 100'000;
    int asked = 0;
    const auto local = ports.createLocalPort("a", [&](auto, auto) {
        ++asked;
        return Bytes(kReply);
    });
    RawPeer peer(pathOf("a"));
    peer.setReadBufferSize(1);
    for (int i = 0; i < 200; ++i)
        peer.send(encodedFrame({0, FrameKind::request, 1, {}}));
    turnFor(100ms);
    EXPECT_LT(asked, 50);
    peer.setReadBufferSize(0);
    EXPECT_TRUE(waitUntil([&] { return peer.bytesAvailable() == 200 * (kReply + 16); }));
}

TEST_F(HostilePeerTest, PeerOfAnotherUserIsRefused)
{
    if (geteuid() != 0)
        GTEST_SKIP() << "only root can become another user";
    const auto local = ports.createLocalPort("a", collector());
    // Another user whose access to files is still root's: the closed directory would keep it out.
    constexpr uid_t kNobody = 65534;
    ASSERT_EQ(seteuid(kNobody), 0);
    setfsuid(0);
    RawPeer peer(pathOf("a"));
    ASSERT_EQ(seteuid(0), 0);
    peer.say(1, "let me in");
    EXPECT_TRUE(waitUntil([&] { return peer.isClosedByOther(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("a peer of user 65534 was refused")));
    EXPECT_EQ(received, "");
}

} // namespace
} // namespace orvex::test
