#pragma once

#include "MessagePort.h"
#include "PortFrame.h"

#include <QLocalSocket>

#include <string>

namespace orvex {

// The sending end of a message channel, connected to the socket of a local port.
//
// A message is accepted whole or not at all: what the peer does not take at once is kept, up to a limit, and
// sent while the event loop runs or more is sent. Above the limit sending waits for its timeout. A peer that
// has gone makes the port invalid; the invalidation callback is called by invalidate() alone.
class RemoteSocketPort final : public RemotePort {
public:
    // Accepted bytes above which sending waits.
    static constexpr std::size_t kMostPendingBytes = std::size_t{8} << 20;

    RemoteSocketPort(std::string name, const std::string& socketPath);
    ~RemoteSocketPort() override;
    RemoteSocketPort(const RemoteSocketPort&) = delete;
    RemoteSocketPort& operator=(const RemoteSocketPort&) = delete;

    bool isValid() const override;
    // What is pending is dropped.
    void invalidate() override;
    void setInvalidationCallback(std::function<void()> callback) override;

    Status send(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout) override;
    SendResult request(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout,
        std::chrono::milliseconds receiveTimeout) override;
    std::size_t pendingBytes() const override;

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

} // namespace orvex
