#pragma once

#include "PortFrame.h"
#include "SocketMessagePorts.h"

#include "EventLoop.h"
#include "PropertyListForms.h"
#include "RecordingLog.h"

#include <gmock/gmock.h>

#include <QEventLoop>
#include <QTemporaryDir>

#include <cerrno>
#include <future>
#include <string>
#include <thread>

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

namespace orvex::test {

// A port directory for each test, and the log.
class PortTest : public testing::Test {
protected:
    std::string directory() const { return _directory.path().toStdString() + "/ports"; }
    std::string pathOf(const std::string& name) const { return directory() + '/' + name; }

    // Collects the port's messages as "id:payload ".
    MessagePorts::Receiver collector()
    {
        return [this](std::int32_t messageId, ByteView data) {
            received += std::to_string(messageId) + ':' + std::string(data.begin(), data.end()) + ' ';
            return std::nullopt;
        };
    }
    bool receives(const std::string& messages) const
    {
        return waitUntil([&] { return received == messages; });
    }

    QTemporaryDir _directory;
    SocketMessagePorts ports{directory()};
    RecordingLog log;
    std::string received;
};

// A socket that talks to a message port byte by byte, without the code under test.
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

    // While the socket is full, runs the event loop and so the port at the other end.
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
    // Sends a one-way message.
    void say(std::int32_t messageId, std::string_view word) const
    {
        write({messageId, FrameKind::oneWay, 0, bytesOf(word)});
    }

    // Reads what has arrived.
    Bytes read() const
    {
        Bytes bytes(1 << 20);
        const auto count = ::recv(_socket, bytes.data(), bytes.size(), MSG_DONTWAIT);
        bytes.resize(count > 0 ? static_cast<std::size_t>(count) : 0);
        return bytes;
    }

    bool isClosedByOther() const
    {
        std::uint8_t byte = 0;
        const auto count = ::recv(_socket, &byte, 1, MSG_DONTWAIT | MSG_PEEK);
        return count == 0 || (count < 0 && errno != EAGAIN);
    }

private:
    int _socket;
};

// A local port served by its own thread, as another process would serve it.
class ServedPort {
public:
    ServedPort(const std::string& directory, const std::string& name, MessagePorts::Receiver receiver)
    {
        std::promise<void> ready;
        _thread = std::thread([&, receiver = std::move(receiver)] {
            QEventLoop loop;
            _loop = &loop;
            SocketMessagePorts ports(directory);
            const auto port = ports.createLocalPort(name, receiver).port;
            ready.set_value();
            loop.exec();
        });
        ready.get_future().wait();
    }
    ~ServedPort()
    {
        QMetaObject::invokeMethod(_loop, &QEventLoop::quit, Qt::QueuedConnection);
        _thread.join();
    }
    ServedPort(const ServedPort&) = delete;
    ServedPort& operator=(const ServedPort&) = delete;

private:
    QEventLoop* _loop = nullptr;
    std::thread _thread;
};

} // namespace orvex::test
