#include "PortTest.h"

#include <fstream>
#include <numeric>

namespace orvex {
namespace {

using namespace std::chrono_literals;
using test::RawPeer;
using test::ServedPort;
using test::textOf;
using test::turnFor;
using test::viewOf;
using test::waitUntil;
using testing::IsEmpty;
using Status = RemotePort::Status;

class SocketMessagePortsTest : public test::PortTest { };

TEST_F(SocketMessagePortsTest, MessagesArriveWholeAndInOrder)
{
    std::vector<std::size_t> sizes(2000);
    std::iota(sizes.begin(), sizes.end(), 0);
    sizes.insert(sizes.begin() + 1000, {3 << 20, kLargestPayload, 70'000});
    std::size_t count = 0;
    const auto local = ports.createLocalPort("a", [&](std::int32_t messageId, ByteView data) {
        EXPECT_EQ(messageId, static_cast<std::int32_t>(count));
        EXPECT_EQ(data.size(), sizes.at(count));
        EXPECT_TRUE(
            data.empty() || (data.front() == std::uint8_t(count) && data.back() == std::uint8_t(count)));
        ++count;
        return std::nullopt;
    });
    ASSERT_TRUE(local.port && local.port->isValid() && !local.alreadyExisted);
    std::thread sender([&] {
        QEventLoop loop; // what Qt needs in a thread that it did not start
        const auto remote = ports.createRemotePort("a");
        for (std::size_t i = 0; i < sizes.size(); ++i) {
            const Bytes data(sizes[i], static_cast<std::uint8_t>(i));
            EXPECT_EQ(remote->send(static_cast<std::int32_t>(i), data, 20s), Status::success);
        }
        while (remote->pendingBytes() > 0)
            loop.processEvents(QEventLoop::WaitForMoreEvents);
    });
    EXPECT_TRUE(waitUntil([&] { return count == sizes.size(); }, 60s));
    sender.join();
    EXPECT_THAT(log.take(), IsEmpty());
}

TEST_F(SocketMessagePortsTest, PartOfAMessageIsWaitedForWithoutHoldingUpOthers)
{
    const auto local = ports.createLocalPort("a", collector());
    RawPeer slow;
    RawPeer other;
    ASSERT_TRUE(slow.connectTo(pathOf("a")) && other.connectTo(pathOf("a")));
    const Bytes bytes = encodedFrame({1, FrameKind::oneWay, 0, viewOf("slow")});
    for (const std::uint8_t byte : bytes) {
        EXPECT_EQ(received, "");
        ASSERT_TRUE(slow.write(ByteView(&byte, 1)));
        ASSERT_TRUE(other.write({2, FrameKind::oneWay, 0, viewOf("quick")}));
        ASSERT_TRUE(waitUntil([&] { return received.find("2:quick ") != std::string::npos; }));
        received.erase(received.find("2:quick "), 8);
    }
    EXPECT_TRUE(waitUntil([&] { return received == "1:slow "; }));
    // Replies that nobody asked for are no messages.
    ASSERT_TRUE(other.write({3, FrameKind::reply, 9, viewOf("what")}));
    ASSERT_TRUE(other.write({4, FrameKind::oneWay, 0, {}}));
    EXPECT_TRUE(waitUntil([&] { return received == "1:slow 4: "; })) << received;
}

TEST_F(SocketMessagePortsTest, RequestsGetTheirOwnReplies)
{
    ServedPort service(directory(), "a", [](std::int32_t messageId, ByteView data) -> std::optional<Bytes> {
        if (messageId == 1)
            std::this_thread::sleep_for(300ms);
        if (messageId == 2)
            return std::nullopt;
        Bytes reply(data.begin(), data.end());
        reply.push_back('!');
        return reply;
    });
    const auto remote = ports.createRemotePort("a");
    ASSERT_TRUE(remote);
    EXPECT_EQ(textOf(remote->request(0, viewOf("first"), 1s, 5s).reply), "first!");

    const auto late = remote->request(1, viewOf("late"), 1s, 50ms);
    EXPECT_EQ(late.status, Status::success);
    EXPECT_FALSE(late.reply);
    // Slow as well, so that the late reply comes first and alone.
    EXPECT_EQ(textOf(remote->request(1, viewOf("after late"), 1s, 5s).reply), "after late!");
    EXPECT_EQ(remote->send(0, viewOf("one-way"), 1s), Status::success);
    EXPECT_FALSE(remote->request(2, viewOf("none"), 1s, 50ms).reply);

    const std::string large(kLargestPayload - 1, 'x');
    EXPECT_EQ(textOf(remote->request(0, viewOf(large), 5s, 20s).reply), large + '!');
    EXPECT_EQ(remote->request(0, viewOf(large + "xx"), 5s, 20s).status, Status::transportError);
    EXPECT_EQ(log.take().size(), 1U);

    service.stop();
    const auto gone = remote->request(0, viewOf("x"), 1s, 20s);
    EXPECT_FALSE(gone.reply);
    EXPECT_FALSE(remote->isValid());
}

TEST_F(SocketMessagePortsTest, NameIsServedOnce)
{
    EXPECT_FALSE(ports.createRemotePort("a"));
    auto first = ports.createLocalPort("a", collector()).port;
    const auto second = ports.createLocalPort("a", [](auto, auto) {
        ADD_FAILURE() << "the second port got a message";
        return std::nullopt;
    });
    EXPECT_TRUE(second.alreadyExisted);
    ASSERT_TRUE(second.port);
    EXPECT_FALSE(second.port->isValid());
    second.port->invalidate();
    ASSERT_EQ(ports.createRemotePort("a")->send(7, viewOf("x"), 1s), Status::success);
    EXPECT_TRUE(waitUntil([&] { return received == "7:x "; }));

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

TEST_F(SocketMessagePortsTest, StaleSocketIsTakenOverByOneStarter)
{
    ASSERT_TRUE(PortDirectory(directory()).isUsable());
    ASSERT_TRUE(RawPeer().listenAt(pathOf("a"))); // leaves its file behind
    constexpr int kStarters = 4;
    std::atomic<int> served = 0;
    std::atomic<int> refused = 0;
    const auto start = [&] {
        const QEventLoop loop;
        const auto result = ports.createLocalPort("a", collector());
        ASSERT_TRUE(result.port);
        result.alreadyExisted ? ++refused : ++served;
        while (served + refused < kStarters)
            std::this_thread::yield();
    };
    auto lock = PortDirectory(directory()).lock();
    std::vector<std::thread> starters;
    starters.reserve(kStarters);
    for (int i = 0; i < kStarters; ++i)
        starters.emplace_back(start);
    std::this_thread::sleep_for(50ms);
    EXPECT_EQ(served + refused, 0) << "a starter went ahead while another held the directory";
    lock.reset();
    for (std::thread& starter : starters)
        starter.join();
    EXPECT_EQ(served, 1);
    EXPECT_EQ(refused, kStarters - 1);

    std::ofstream(pathOf("file")) << "not a socket";
    EXPECT_FALSE(ports.createLocalPort("file", collector()).port);
    EXPECT_EQ(access(pathOf("file").c_str(), F_OK), 0) << "somebody's file was removed";
}

TEST_F(SocketMessagePortsTest, RemotePortNoticesThatItsPeerHasGone)
{
    auto local = ports.createLocalPort("a", collector()).port;
    const auto idle = ports.createRemotePort("a");
    const auto busy = ports.createRemotePort("a");
    turnFor(20ms);
    EXPECT_TRUE(idle->isValid() && busy->isValid());
    local.reset();
    EXPECT_EQ(busy->send(0, viewOf("x"), 1s), Status::transportError);
    EXPECT_FALSE(busy->isValid());
    EXPECT_EQ(busy->send(0, viewOf("x"), 1s), Status::invalid);
    EXPECT_TRUE(waitUntil([&] { return !idle->isValid(); }));

    int invalidations = 0;
    idle->setInvalidationCallback([&] { ++invalidations; });
    idle->invalidate();
    idle->invalidate();
    EXPECT_EQ(invalidations, 1);
}

TEST_F(SocketMessagePortsTest, SendingWaitsForAPeerThatDoesNotReadAndLosesNothing)
{
    ASSERT_TRUE(PortDirectory(directory()).isUsable());
    RawPeer listener;
    ASSERT_TRUE(listener.listenAt(pathOf("a")));
    const auto remote = ports.createRemotePort("a");
    ASSERT_TRUE(remote);
    RawPeer reader(listener.acceptOne());
    const Bytes data(1 << 20, 7);
    std::int32_t accepted = 0;
    while (remote->send(accepted, data, 0ms) == Status::success)
        ASSERT_LT(++accepted, 64);
    EXPECT_GT(remote->pendingBytes(), std::size_t{8} << 20);
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(remote->send(accepted, data, 100ms), Status::sendTimeout);
    EXPECT_GE(std::chrono::steady_clock::now() - start, 100ms);

    FrameReader frames;
    std::int32_t arrived = 0;
    EXPECT_TRUE(waitUntil([&] {
        frames.append(reader.read());
        while (const auto frame = frames.take()) {
            EXPECT_EQ(frame->messageId, arrived++);
            EXPECT_EQ(frame->payload.size(), data.size());
        }
        return remote->pendingBytes() == 0 && !frames.isInsideFrame();
    }));
    EXPECT_EQ(arrived, accepted) << "a message that was not accepted must not arrive";
}

} // namespace
} // namespace orvex
