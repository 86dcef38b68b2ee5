#pragma once

#include "MessagePort.h"
#include "PortConnection.h"
#include "PortDirectory.h"

#include <memory>
#include <string>
#include <vector>

class QLocalServer;
class QLocalSocket;

namespace orvex {

// The receiving end of a message channel: a socket file in the port directory, and any number of peers up to
// a limit, all of them this user or root. Messages of one peer keep their order. Beyond the limit a new peer
// takes the place of one that connected and kept silent; a peer that speaks keeps its place.
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

    bool isValid() const override { return _server != nullptr; }
    void invalidate() override;
    void deliverWaiting() override;
    void setInvalidationCallback(std::function<void()> callback) override;

private:
    void acceptPeers();
    bool isWelcome(const QLocalSocket& socket) const;
    // Where all places are taken, makes one by closing the oldest connection that never said anything.
    bool makeRoom();
    void remove(PortConnection* connection);
    void close();

    PortDirectory _directory;
    std::string _name;
    PortConnection::Receiver _receiver;
    std::function<void()> _invalidationCallback;
    std::unique_ptr<QLocalServer> _server; // null when the port is not valid
    std::vector<std::unique_ptr<PortConnection>> _connections;
};

} // namespace orvex
