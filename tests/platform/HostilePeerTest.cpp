#include "PortTest.h"
#include "QtRunLoop.h"

#include <deque>

#include <sys/fsuid.h>
#include <sys/resource.h>

namespace orvex {
namespace {

using namespace std::chrono_literals;
using test::RawPeer;
using test::turnFor;
using test::waitUntil;
using testing::ElementsAre;
using testing::HasSubstr;

class HostilePeerTest : public test::PortTest { };

TEST_F(HostilePeerTest, NonsenseClosesOnlyItsOwnConnection)
{
    const auto local = ports.createLocalPort("a", collector());
    const RawPeer good(pathOf("a"));
    const std::pair<Bytes, const char*> cases[] = {
        {{1, 0, 0, 1, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0}, "more than 16 MiB"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 3, 0, 0, 0, 0, 0, 0, 0}, "unknown kind"},
        {{0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0}, "unknown kind"},
    };
    for (const auto& [bytes, reason] : cases) {
        const RawPeer bad(pathOf("a"));
        bad.say(1, "before");
        bad.write(bytes);
        EXPECT_TRUE(waitUntil([&] { return bad.isClosedByOther(); })) << reason;
        EXPECT_THAT(log.take(), ElementsAre(HasSubstr(reason)));
        good.say(2, "good");
        EXPECT_TRUE(receives("1:before 2:good ")) << received;
        received.clear();
    }
    {
        const RawPeer vanishing(pathOf("a"));
        for (int i = 0; i < 300; ++i)
            vanishing.write({i, FrameKind::request, 1, {}});
        vanishing.write(Bytes{9, 0, 0, 0, 1});
    }
    EXPECT_TRUE(waitUntil([&] { return !log.lines.empty(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("inside a message")));
    EXPECT_THAT(received, HasSubstr("299: ")) << "messages sent before it left count";
}

TEST_F(HostilePeerTest, IdlePeersMakeRoomAndActiveOnesDoNot)
{
    const auto local = ports.createLocalPort("a", collector());
    std::deque<RawPeer> active;
    for (int i = 0; i < 16; ++i) {
        active.emplace_back(pathOf("a")).say(1, "x");
        turnFor(1ms);
    }
    ASSERT_TRUE(waitUntil([&] { return received.size() == 16 * 4; }));
    {
        const RawPeer refused(pathOf("a"));
        EXPECT_TRUE(waitUntil([&] { return refused.isClosedByOther(); }));
        EXPECT_THAT(log.take(), ElementsAre(HasSubstr("a peer was refused, 16 are connected")));
    }
    turnFor(1100ms);
    active.front().say(1, "on");
    turnFor(10ms);
    received.clear();
    const RawPeer late(pathOf("a"));
    late.say(1, "late");
    EXPECT_TRUE(receives("1:late ")) << received;
    EXPECT_TRUE(active[1].isClosedByOther()) << "it has been idle for longest";
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("an idle peer was closed, 16 are connected")));
    active.pop_back(); // leaves of its own accord
    turnFor(20ms);
    const RawPeer next(pathOf("a"));
    next.say(1, "next");
    EXPECT_TRUE(receives("1:late 1:next ")) << received;
    EXPECT_THAT(log.take(), ElementsAre()) << "nobody is closed for it";
}

TEST_F(HostilePeerTest, PeersThatNeverSpeakDoNotKeepOthersOut)
{
    const auto local = ports.createLocalPort("a", collector());
    const RawPeer real(pathOf("a"));
    real.say(1, "here");
    const RawPeer slow(pathOf("a"));
    slow.write(Bytes(kFrameHeaderSize - 1));
    ASSERT_TRUE(receives("1:here "));
    std::deque<RawPeer> silent;
    for (int i = 0; i < 1000; ++i) {
        silent.emplace_back(pathOf("a"));
        QCoreApplication::processEvents();
        if (silent.size() > 200)
            silent.pop_front(); // the test has its limits too
        if (i % 100 == 0)
            real.say(1, "on");
    }
    EXPECT_TRUE(slow.isClosedByOther()) << "part of a message does not count";
    const RawPeer late(pathOf("a"));
    late.say(3, "late");
    EXPECT_TRUE(waitUntil([&] { return received.ends_with("3:late "); })) << received;
    EXPECT_EQ(received.size(), 7U + 10 * 5 + 7);
    EXPECT_THAT(log.take(), testing::Each(HasSubstr("an idle peer was closed, 16 are connected")));
}

TEST_F(HostilePeerTest, PartialMessagesAreBoundedInTotal)
{
    const auto local = ports.createLocalPort("a", collector());
    const Bytes most = encodedFrame({1, FrameKind::oneWay, 0, Bytes(kLargestPayload)});
    std::deque<RawPeer> peers;
    for (int i = 0; i < 4; ++i) {
        peers.emplace_back(pathOf("a")).write(ByteView(most).first(most.size() - 100));
        turnFor(20ms);
    }
    EXPECT_TRUE(log.take().empty());
    RawPeer honest(pathOf("a"));
    honest.write(most);
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
    received.clear();
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
    const RawPeer peer(pathOf("a"));
    peer.say(1, "here");
    EXPECT_TRUE(waitUntil([&] { return !log.lines.empty(); }));
    turnFor(700ms); // the next attempt fails too
    for (const int descriptor : descriptors)
        close(descriptor);
    setrlimit(RLIMIT_NOFILE, &limit);
    EXPECT_TRUE(receives("1:here "));
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
    const RawPeer peer(pathOf("a"));
    QtRunLoop loop;
    const auto timer = loop.startTimer(1ms, [&] { inOneTurn = 0; });
    peer.write(Bytes(5000 * kFrameHeaderSize)); // empty messages
    EXPECT_TRUE(waitUntil([&] { return all == 5000; }));
    EXPECT_LE(most, 64);
}

TEST_F(HostilePeerTest, PeerThatDoesNotReadItsRepliesWaits)
{
    int asked = 0;
    const auto local = ports.createLocalPort("a", [&](auto, auto) {
        ++asked;
        return Bytes(100'000);
    });
    const RawPeer peer(pathOf("a"));
    for (int i = 0; i < 200; ++i)
        peer.write({0, FrameKind::request, 1, {}});
    turnFor(100ms);
    EXPECT_LT(asked, 50);
    std::size_t bytes = 0;
    EXPECT_TRUE(waitUntil([&] {
        bytes += peer.read().size();
        return bytes == 200 * (100'000 + kFrameHeaderSize);
    }));
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
    const RawPeer peer(pathOf("a"));
    ASSERT_EQ(seteuid(0), 0);
    peer.say(1, "let me in");
    EXPECT_TRUE(waitUntil([&] { return peer.isClosedByOther(); }));
    EXPECT_THAT(log.take(), ElementsAre(HasSubstr("a peer of user 65534 was refused")));
    EXPECT_EQ(received, "");
}

} // namespace
} // namespace orvex
