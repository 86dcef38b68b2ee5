#include "SocketMessagePorts.h"

#include "LocalSocketPort.h"
#include "RemoteSocketPort.h"

namespace orvex {

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
