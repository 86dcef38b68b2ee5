#include "SocketMessagePorts.h"

#include "LocalSocketPort.h"
#include "PortFrame.h"
#include "SystemLog.h"

#include <QDeadlineTimer>
#include <QLocalSocket>

#include <utility>

namespace orvex {

namespace {
constexpr int kConnectMilliseconds = 1000;
constexpr std::size_t kMostPendingBytes = std::size_t{8} << 20; // above which sending waits

// The sending end of a message channel, connected to the socket of a local port.
//
// A message is accepted whole or not at all. What the peer does not take at once is kept, up to a limit, and
// sent while the event loop runs or more is sent. Above the limit, send() waits for its timeout. A peer that
// goes makes the port invalid, but only invalidate() calls the callback.
class RemoteSocketPort final : public RemotePort {
public:
    RemoteSocketPort(std::string name, const std::string& socketPath);
    ~RemoteSocketPort() override;
    RemoteSocketPort(const RemoteSocketPort&) = delete;
    RemoteSocketPort& operator=(const RemoteSocketPort&) = delete;

    bool isValid() const override { return _socket.state() == QLocalSocket::ConnectedState; }
    // Drops what is pending.
    void invalidate() override;
    void setInvalidationCallback(std::function<void()> callback) override;

    Status send(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout) override;
    SendResult request(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout,
        std::chrono::milliseconds receiveTimeout) override;
    std::size_t pendingBytes() const override { return static_cast<std::size_t>(_socket.bytesToWrite()); }

private:
    Status write(const Frame& frame, std::chrono::milliseconds timeout);
    void readReplies();

    std::string _name;
    QLocalSocket _socket;
    FrameReader _reader;
    std::uint32_t _lastCorrelation = 0;
    std::uint32_t _awaitedCorrelation = 0; // 0 while no reply is awaited
    std::optional<Bytes> _reply;
    std::function<void()> _invalidationCallback;
};

RemoteSocketPort::RemoteSocketPort(std::string name, const std::string& socketPath)
    : _name(std::move(name))
{
    QObject::connect(&_socket, &QLocalSocket::readyRead, &_socket, [this] { readReplies(); });
    _socket.connectToServer(QString::fromStdString(socketPath));
    if (!_socket.waitForConnected(kConnectMilliseconds))
        _socket.abort();
}

RemoteSocketPort::~RemoteSocketPort()
{
    _socket.disconnect();
    _socket.flush();
    _socket.abort();
}

void RemoteSocketPort::invalidate()
{
    _socket.flush();
    _socket.abort();
    // The callback may destroy the port.
    if (const auto callback = std::exchange(_invalidationCallback, {}))
        callback();
}

void RemoteSocketPort::setInvalidationCallback(std::function<void()> callback)
{
    _invalidationCallback = std::move(callback);
}

RemotePort::Status RemoteSocketPort::send(
    std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout)
{
    return write({messageId, FrameKind::oneWay, 0, data}, sendTimeout);
}

RemotePort::SendResult RemoteSocketPort::request(std::int32_t messageId, ByteView data,
    std::chrono::milliseconds sendTimeout, std::chrono::milliseconds receiveTimeout)
{
    if (++_lastCorrelation == 0)
        ++_lastCorrelation; // 0 marks one-way messages
    _reply.reset();
    _awaitedCorrelation = _lastCorrelation;
    SendResult result;
    result.status = write({messageId, FrameKind::request, _lastCorrelation, data}, sendTimeout);
    if (result.status == Status::success) {
        const QDeadlineTimer deadline(receiveTimeout);
        while (!_reply && isValid() && !deadline.hasExpired())
            _socket.waitForReadyRead(static_cast<int>(deadline.remainingTime()));
        result.reply = std::exchange(_reply, std::nullopt);
    }
    _awaitedCorrelation = 0;
    return result;
}

RemotePort::Status RemoteSocketPort::write(const Frame& frame, std::chrono::milliseconds timeout)
{
    if (!isValid())
        return Status::invalid;
    if (frame.payload.size() > kLargestPayload) {
        systemLog(Priority::error, "Message port %s: a message of %zu bytes is too long", _name.c_str(),
            frame.payload.size());
        return Status::transportError;
    }
    const QDeadlineTimer deadline(timeout);
    while (pendingBytes() > kMostPendingBytes) {
        _socket.waitForBytesWritten(static_cast<int>(deadline.remainingTime()));
        if (!isValid())
            return Status::transportError;
        if (pendingBytes() > kMostPendingBytes && deadline.hasExpired())
            return Status::sendTimeout;
    }
    const Bytes bytes = encodedFrame(frame);
    _socket.write(reinterpret_cast<const char*>(bytes.data()), static_cast<qint64>(bytes.size()));
    _socket.flush();
    return isValid() ? Status::success : Status::transportError;
}

void RemoteSocketPort::readReplies()
{
    const QByteArray bytes = _socket.readAll();
    _reader.append(ByteView(
        reinterpret_cast<const std::uint8_t*>(bytes.data()), static_cast<std::size_t>(bytes.size())));
    while (const auto frame = _reader.take()) {
        // Anything else is a late or unrequested reply.
        if (frame->kind == FrameKind::reply && frame->correlation == _awaitedCorrelation
            && _awaitedCorrelation)
            _reply.emplace(frame->payload.begin(), frame->payload.end());
    }
    if (_reader.fault()) {
        systemLog(Priority::error, "Message port %s: connection closed, %s", _name.c_str(), _reader.fault());
        _socket.abort();
    }
}
} // namespace

MessagePorts::LocalPortResult SocketMessagePorts::createLocalPort(const std::string& name, Receiver receiver)
{
    auto port = std::make_shared<LocalSocketPort>(_directory, name, std::move(receiver));
    switch (port->listen()) {
    case LocalSocketPort::ListenResult::listening: return {std::move(port), false};
    case LocalSocketPort::ListenResult::alreadyExists: return {std::move(port), true};
    case LocalSocketPort::ListenResult::failed: break;
    }
    return {};
}

std::shared_ptr<RemotePort> SocketMessagePorts::createRemotePort(const std::string& name)
{
    const auto path = _directory.socketPath(name);
    if (!path || !_directory.isUsable())
        return nullptr;
    auto port = std::make_shared<RemoteSocketPort>(name, *path);
    return port->isValid() ? port : nullptr;
}

} // namespace orvex
