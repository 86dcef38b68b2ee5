#pragma once

#include "MessagePort.h"
#include "PortFrame.h"

#include <QBasicTimer>
#include <QElapsedTimer>
#include <QObject>

#include <chrono>
#include <functional>
#include <memory>
#include <string>

class QLocalSocket;

namespace orvex {

// One peer of a local port: reads its messages, hands them to the receiver and sends the replies back.
//
// A turn of the event loop handles a bounded number of messages, and none while the peer does not take its
// replies; the rest waits in the socket and slows the sender down. Messages are handled from a timer and
// never from a signal of the socket, so a receiver may destroy the connection.
class PortConnection final : public QObject {
public:
    using Receiver = std::shared_ptr<const MessagePorts::Receiver>;
    // Asks the owner to destroy the connection, which has ended.
    using EndHandler = std::function<void(PortConnection*)>;
    // Called when the last frame is incomplete. May destroy the connection.
    using PartialHandler = std::function<void()>;

    PortConnection(std::string portName, std::unique_ptr<QLocalSocket> socket, Receiver receiver,
        EndHandler onEnd, PartialHandler onPartial);
    ~PortConnection() override;

    // Handles what has arrived, without the event loop. Returns even if the peer keeps sending.
    void handleWaiting();

    // True while a message is being handled; the connection must stay meanwhile.
    bool isHandling() const { return _isHandling; }
    // True once it has sent a whole message.
    bool hasSpoken() const { return _hasSpoken; }
    // Since its last whole message, or since it connected.
    std::chrono::milliseconds idleTime() const { return std::chrono::milliseconds(_idle.elapsed()); }
    std::size_t partialBytes() const { return _reader->partialBytes(); }

private:
    void timerEvent(QTimerEvent*) noexcept override;
    void wake();
    bool handleMessages();
    bool readMore();
    bool isWaitingForPeer() const;
    void reply(const Frame& request, const Bytes& payload);

    std::string _portName;
    std::unique_ptr<QLocalSocket> _socket;
    std::shared_ptr<FrameReader> _reader; // shared with handleMessages(), which may outlive this
    Receiver _receiver;
    EndHandler _onEnd;
    PartialHandler _onPartial;
    QElapsedTimer _idle;
    QBasicTimer _turn;
    bool _isHandling = false;
    bool _hasSpoken = false;
};

} // namespace orvex
