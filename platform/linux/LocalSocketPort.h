#pragma once

#include "MessagePort.h"
#include "PortConnection.h"
#include "PortDirectory.h"

#include <QSocketNotifier>

#include <memory>
#include <string>
#include <vector>

class QLocalSocket;

namespace orvex {

// The receiving end of a message channel: a socket file in the port directory, and a limited number of peers,
// all of them this user or root. Messages of one peer keep their order. A peer beyond the limit replaces one
// that has never sent a message, else the one that has been idle for longest, and is refused only while all
// are active. Partial messages are limited in total: above that, the peer whose message has waited longest is
// closed.
class LocalSocketPort final : public LocalPort {
public:
    enum class ListenResult { listening, alreadyExists, failed };

    // Not valid before listen().
    LocalSocketPort(PortDirectory directory, std::string name, MessagePorts::Receiver receiver);
    // Closes the port without calling the invalidation callback.
    ~LocalSocketPort() override;
    LocalSocketPort(const LocalSocketPort&) = delete;
    LocalSocketPort& operator=(const LocalSocketPort&) = delete;

    // Takes over a socket file that nobody serves. Failures go to the system log.
    ListenResult listen();

    bool isValid() const override { return _listener != nullptr; }
    void invalidate() override;
    void deliverWaiting() override;
    void setInvalidationCallback(std::function<void()> callback) override;

private:
    void acceptPeers();
    bool isWelcome(const QLocalSocket& socket) const;
    bool isPeerWaiting() const;
    void pauseListening(int error);
    // True when there is room for another connection, after closing an idle one if need be.
    bool makeRoom();
    void boundPartialMessages();
    void remove(PortConnection* connection);
    void close();

    PortDirectory _directory;
    std::string _name;
    PortConnection::Receiver _receiver;
    std::function<void()> _invalidationCallback;
    std::unique_ptr<QSocketNotifier> _listener; // null when the port is not valid
    bool _isShortOfDescriptors = false;
    std::vector<std::unique_ptr<PortConnection>> _connections;
};

} // namespace orvex
