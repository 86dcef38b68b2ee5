#pragma once

#include "SocketMessagePorts.h"

#include "EventLoop.h"
#include "PropertyListForms.h"
#include "RawPeer.h"
#include "RecordingLog.h"

#include <gmock/gmock.h>

#include <QEventLoop>
#include <QTemporaryDir>

#include <future>
#include <thread>

namespace orvex::test {

// A port directory of its own for each test, and the log.
class PortTest : public testing::Test {
protected:
    std::string directory() const { return _directory.path().toStdString() + "/ports"; }
    std::string pathOf(const std::string& name) const { return directory() + '/' + name; }

    // The messages that the port got, as "id:payload ".
    MessagePorts::Receiver collector()
    {
        return [this](std::int32_t messageId, ByteView data) {
            received += std::to_string(messageId) + ':' + std::string(data.begin(), data.end()) + ' ';
            return std::nullopt;
        };
    }

    QTemporaryDir _directory;
    SocketMessagePorts ports{directory()};
    RecordingLog log;
    std::string received;
};

// A local port that is served by a thread of its own, as another process would serve it.
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
