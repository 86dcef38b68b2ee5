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
// a limit, all of them this user or root. Messages of one peer keep their order. Beyond the limit a new peer
// takes the place of the one that has been idle for longest, first of all one that never said anything; only
// when all of them are talking it is refused. The messages that have come in part are bounded as a whole: the
// one that has waited for longest goes, and its peer.
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
    std::vector<std::unique_ptr<PortConnection>> _connections;
};

} // namespace orvex
