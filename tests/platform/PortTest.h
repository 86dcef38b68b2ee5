#pragma once

#include "PortFrame.h"
#include "SocketMessagePorts.h"

#include "EventLoop.h"
#include "PropertyListForms.h"
#include "RecordingLog.h"

#include <gmock/gmock.h>

#include <QEventLoop>
#include <QLocalSocket>
#include <QTemporaryDir>

#include <future>
#include <string>
#include <thread>

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
class RawPeer : public QLocalSocket {
public:
    explicit RawPeer(const std::string& path)
    {
        connectToServer(QString::fromStdString(path));
        EXPECT_TRUE(waitForConnected()) << path;
    }
    void send(const Bytes& bytes)
    {
        write(reinterpret_cast<const char*>(bytes.data()), static_cast<qint64>(bytes.size()));
        flush(); // the event loop sends what does not fit now
    }
    // Sends a one-way message.
    void say(std::int32_t messageId, std::string_view word)
    {
        send(encodedFrame({messageId, FrameKind::oneWay, 0, bytesOf(word)}));
    }
    bool isClosedByOther() const { return state() == UnconnectedState; }
};

// A local port served by its own thread, as another process would serve it.
class ServedPort {
public:
    ServedPort(const std::string& directory, const std::string& name, MessagePorts::Receiver receiver)
        : _thread([=, this] {
            QEventLoop loop;
            SocketMessagePorts ports(directory);
            const auto port = ports.createLocalPort(name, receiver).port;
            _loop.set_value(&loop);
            loop.exec();
        })
        , _running(_loop.get_future().get())
    {
    }
    ~ServedPort() { QMetaObject::invokeMethod(_running, &QEventLoop::quit, Qt::QueuedConnection); }
    ServedPort(const ServedPort&) = delete;
    ServedPort& operator=(const ServedPort&) = delete;

private:
    std::promise<QEventLoop*> _loop;
    std::jthread _thread;
    QEventLoop* _running;
};

} // namespace orvex::test
