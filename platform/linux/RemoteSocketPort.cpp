#include "RemoteSocketPort.h"

#include "SystemLog.h"

#include <QDeadlineTimer>

#include <utility>

namespace orvex {

namespace {
constexpr int kConnectMilliseconds = 1000;
} // namespace

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

bool RemoteSocketPort::isValid() const
{
    return _socket.state() == QLocalSocket::ConnectedState;
}

void RemoteSocketPort::invalidate()
{
    const bool wasOpen = _socket.isOpen();
    _socket.flush();
    _socket.abort();
    if (!wasOpen)
        return;
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
        ++_lastCorrelation; // 0 is that of one-way messages
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

std::size_t RemoteSocketPort::pendingBytes() const
{
    return static_cast<std::size_t>(_socket.bytesToWrite());
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
        // Anything else is a reply that came too late, or something that nobody asked for.
        if (frame->kind == FrameKind::reply && frame->correlation == _awaitedCorrelation
            && _awaitedCorrelation)
            _reply.emplace(frame->payload.begin(), frame->payload.end());
    }
    if (_reader.fault()) {
        systemLog(Priority::error, "Message port %s: connection closed, %s", _name.c_str(), _reader.fault());
        _socket.abort();
    }
}

} // namespace orvex
