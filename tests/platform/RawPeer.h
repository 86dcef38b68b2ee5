#pragma once

#include "PortFrame.h"

#include <gtest/gtest.h>

#include <QCoreApplication>

#include <cerrno>
#include <string>

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

namespace orvex::test {

// A socket that speaks to a message port byte by byte, with no help of the code under test.
class RawPeer {
public:
    explicit RawPeer(const std::string& path)
        : _socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0))
    {
        sockaddr_un address{};
        address.sun_family = AF_UNIX;
        path.copy(address.sun_path, sizeof address.sun_path - 1);
        EXPECT_EQ(::connect(_socket, reinterpret_cast<const sockaddr*>(&address), sizeof address), 0) << path;
    }
    ~RawPeer() { ::close(_socket); }
    RawPeer(const RawPeer&) = delete;
    RawPeer& operator=(const RawPeer&) = delete;

    // Turns the event loop, and so the port at the other end, while the socket is full.
    void write(ByteView bytes) const
    {
        while (!bytes.empty()) {
            const auto count = ::send(_socket, bytes.data(), bytes.size(), MSG_NOSIGNAL | MSG_DONTWAIT);
            if (count < 0 && errno == EAGAIN) {
                QCoreApplication::processEvents();
                continue;
            }
            ASSERT_GT(count, 0);
            bytes = bytes.subspan(static_cast<std::size_t>(count));
        }
    }
    void write(const Frame& frame) const { write(encodedFrame(frame)); }
    // A one-way message.
    void say(std::int32_t messageId, std::string_view word) const
    {
        write({messageId, FrameKind::oneWay, 0, Bytes(word.begin(), word.end())});
    }

    // What is there to be read at this moment.
    Bytes read() const
    {
        Bytes bytes(1 << 20);
        const auto count = ::recv(_socket, bytes.data(), bytes.size(), MSG_DONTWAIT);
        bytes.resize(count > 0 ? static_cast<std::size_t>(count) : 0);
        return bytes;
    }

    // True once the other side has closed and all that it wrote is read.
    bool isClosedByOther() const
    {
        std::uint8_t byte = 0;
        const auto count = ::recv(_socket, &byte, 1, MSG_DONTWAIT | MSG_PEEK);
        return count == 0 || (count < 0 && errno != EAGAIN);
    }

private:
    int _socket;
};

} // namespace orvex::test
