#pragma once

#include "MessagePort.h"
#include "PortDirectory.h"

#include <string>

namespace orvex {

// Message ports between processes of one user, on Unix-domain stream sockets with the frames of PortFrame.h.
// They run on the event loop of the thread that creates them.
class SocketMessagePorts final : public MessagePorts {
public:
    // Uses the port directory that the environment names.
    SocketMessagePorts() = default;
    explicit SocketMessagePorts(std::string directory)
        : _directory(std::move(directory))
    {
    }

    // An exception that leaves the receiver ends the process.
    LocalPortResult createLocalPort(const std::string& name, Receiver receiver) override;
    std::shared_ptr<RemotePort> createRemotePort(const std::string& name) override;

private:
    PortDirectory _directory;
};

} // namespace orvex
