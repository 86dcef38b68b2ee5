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

// The receiving end of a message channel: a socket file in the port directory, and any number of peers up to
// a limit, all of them this user or root. Messages of one peer keep their order. A new peer
// beyond the limit replaces one that never sent a message, else the one that is idle for longest; it is
// refused only while all are active. Partial messages are bounded in all: the one that has waited for longest
// goes, and its peer.
class LocalSocketPort final : public LocalPort {
public:
    enum class ListenResult { listening, alreadyExists, failed };

    // Not valid until it listens.
    LocalSocketPort(PortDirectory directory, std::string name, MessagePorts::Receiver receiver);
    // Closes the port without calling the invalidation callback.
    ~LocalSocketPort() override;
    LocalSocketPort(const LocalSocketPort&) = delete;
    LocalSocketPort& operator=(const LocalSocketPort&) = delete;

    // Takes over a socket file that nobody serves. Failures are told in the system log.
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
    // Where all places are taken, makes one by closing the connection that is idle for longest.
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
