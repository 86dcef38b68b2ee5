#include "PortConnection.h"

#include "SystemLog.h"

#include <QLocalSocket>
#include <QPointer>

#include <array>

namespace orvex {

namespace {
constexpr int kMessagesPerTurn = 64;
constexpr int kTurnsAtOnce = 2048;
constexpr qint64 kUnhandledBytes = qint64{1} << 20; // read from the socket ahead of being handled
constexpr qint64 kUnreadReplyBytes = qint64{1} << 20;
} // namespace

PortConnection::PortConnection(std::string portName, std::unique_ptr<QLocalSocket> socket, Receiver receiver,
    EndHandler onEnd, PartialHandler onPartial)
    : _portName(std::move(portName))
    , _socket(std::move(socket))
    , _reader(std::make_shared<FrameReader>())
    , _receiver(std::move(receiver))
    , _onEnd(std::move(onEnd))
    , _onPartial(std::move(onPartial))
{
    _idle.start();
    _socket->setReadBufferSize(kUnhandledBytes);
    connect(_socket.get(), &QLocalSocket::readyRead, this, [this] { wake(); });
    connect(_socket.get(), &QLocalSocket::disconnected, this, [this] { wake(); });
    connect(_socket.get(), &QLocalSocket::bytesWritten, this, [this] { wake(); });
    wake(); // for what arrived before the signals were connected
}

PortConnection::~PortConnection()
{
    _socket->disconnect(this); // or closing the socket would wake this
}

void PortConnection::wake()
{
    if (!_turn.isActive() && !_isHandling)
        _turn.start(0, this);
}

void PortConnection::timerEvent(QTimerEvent*) noexcept
{
    _turn.stop();
    handleMessages();
}

void PortConnection::handleWaiting()
{
    const QPointer<PortConnection> alive(this);
    bool goesOn = !_isHandling;
    for (int turn = 0; goesOn && turn < kTurnsAtOnce; ++turn) {
        const bool hasCome = _socket->state() == QLocalSocket::ConnectedState && _socket->waitForReadyRead(0);
        goesOn = (handleMessages() || hasCome) && alive;
    }
}

// True if there were any.
bool PortConnection::handleMessages()
{
    const QPointer<PortConnection> alive(this);
    const auto reader = _reader;
    _isHandling = true; // if the receiver runs an event loop, later messages wait
    int handled = 0;
    while (handled < kMessagesPerTurn && !isWaitingForPeer()) {
        const auto message = reader->take();
        if (!message) {
            if (!reader->fault() && readMore())
                continue;
            break;
        }
        ++handled;
        _hasSpoken = true;
        if (message->kind == FrameKind::reply)
            continue; // to nothing
        const auto receiver = _receiver;
        const auto answer = (*receiver)(message->messageId, message->payload);
        if (!alive)
            return true;
        if (answer && message->kind == FrameKind::request)
            reply(*message, *answer);
    }
    _isHandling = false;
    if (handled > 0)
        _idle.start();
    if (handled == kMessagesPerTurn) {
        wake();
        return true;
    }
    if (isWaitingForPeer())
        return handled > 0;

    // Everything that arrived is handled.
    if (reader->fault())
        systemLog(
            Priority::error, "Message port %s: connection closed, %s", _portName.c_str(), reader->fault());
    else if (_socket->state() == QLocalSocket::ConnectedState) {
        if (reader->isInsideFrame())
            _onPartial();
        return handled > 0;
    } else if (reader->isInsideFrame())
        systemLog(Priority::warning, "Message port %s: a peer left inside a message", _portName.c_str());
    _onEnd(this); // destroys this
    return handled > 0;
}

bool PortConnection::readMore()
{
    std::array<std::uint8_t, 65536> chunk; // NOLINT(cppcoreguidelines-pro-type-member-init): filled by read()
    const qint64 length = _socket->read(reinterpret_cast<char*>(chunk.data()), chunk.size());
    if (length <= 0)
        return false;
    _reader->append(ByteView(chunk.data(), static_cast<std::size_t>(length)));
    return true;
}

bool PortConnection::isWaitingForPeer() const
{
    return _socket->bytesToWrite() > kUnreadReplyBytes && _socket->state() == QLocalSocket::ConnectedState;
}

void PortConnection::reply(const Frame& request, const Bytes& payload)
{
    if (payload.size() > kLargestPayload)
        return systemLog(Priority::error, "Message port %s: a reply of %zu bytes is too long",
            _portName.c_str(), payload.size());
    if (_socket->state() != QLocalSocket::ConnectedState)
        return; // the requester has gone
    const Bytes bytes =
        encodedFrame({request.messageId, FrameKind::reply, request.correlation, ByteView(payload)});
    _socket->write(reinterpret_cast<const char*>(bytes.data()), static_cast<qint64>(bytes.size()));
    _socket->flush();
}

} // namespace orvex
