#include "LocalSocketPort.h"

#include "SystemLog.h"

#include <QLocalServer>
#include <QLocalSocket>
#include <QPointer>

#include <algorithm>
#include <cerrno>
#include <cstring>

#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

namespace orvex {

namespace {
constexpr std::size_t kMostConnections = 64;

// The error of a connection attempt to the socket; 0 when somebody listens there.
int connectionError(const std::string& path)
{
    const int probe = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
    if (probe < 0)
        return errno;
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    path.copy(address.sun_path, sizeof address.sun_path - 1);
    const auto* generic = reinterpret_cast<const sockaddr*>(&address);
    const int error = connect(probe, generic, sizeof address) == 0 ? 0 : errno;
    close(probe);
    return error == EAGAIN || error == EINPROGRESS ? 0 : error; // a listener that is busy
}

bool isSocketFile(const std::string& path)
{
    struct stat status { };
    return lstat(path.c_str(), &status) == 0 && S_ISSOCK(status.st_mode);
}
} // namespace

LocalSocketPort::LocalSocketPort(PortDirectory directory, std::string name, MessagePorts::Receiver receiver)
    : _directory(std::move(directory))
    , _name(std::move(name))
    , _receiver(std::make_shared<const MessagePorts::Receiver>(std::move(receiver)))
{
}

LocalSocketPort::~LocalSocketPort()
{
    close();
}

LocalSocketPort::ListenResult LocalSocketPort::listen()
{
    const auto path = _directory.socketPath(_name);
    if (!path || !_directory.isUsable())
        return ListenResult::failed;
    const auto lock = _directory.lock(); // two starters that find the same stale file
    if (!lock)
        return ListenResult::failed;
    const int error = connectionError(*path);
    if (error == 0)
        return ListenResult::alreadyExists;
    if (error == ECONNREFUSED && isSocketFile(*path))
        unlink(path->c_str());

    auto server = std::make_unique<QLocalServer>();
    if (!server->listen(QString::fromStdString(*path))) {
        systemLog(Priority::error, "Message port %s: %s", _name.c_str(), qPrintable(server->errorString()));
        return ListenResult::failed;
    }
    _server = std::move(server);
    QObject::connect(_server.get(), &QLocalServer::newConnection, _server.get(), [this] { acceptPeers(); });
    return ListenResult::listening;
}

void LocalSocketPort::acceptPeers()
{
    while (QLocalSocket* peer = _server->nextPendingConnection()) {
        std::unique_ptr<QLocalSocket> socket(peer);
        socket->setParent(nullptr); // it is ours, not the server's
        if (isWelcome(*socket) && makeRoom())
            _connections.push_back(std::make_unique<PortConnection>(_name, std::move(socket), _receiver,
                [this](PortConnection* connection) { remove(connection); }));
    }
}

bool LocalSocketPort::isWelcome(const QLocalSocket& socket) const
{
    ucred peer{};
    socklen_t size = sizeof peer;
    const int descriptor = static_cast<int>(socket.socketDescriptor());
    if (getsockopt(descriptor, SOL_SOCKET, SO_PEERCRED, &peer, &size) != 0) {
        systemLog(Priority::error, "Message port %s: a peer without credentials was refused", _name.c_str());
        return false;
    }
    if (peer.uid != geteuid() && peer.uid != 0) {
        systemLog(Priority::error, "Message port %s: a peer of user %u was refused", _name.c_str(), peer.uid);
        return false;
    }
    return true;
}

bool LocalSocketPort::makeRoom()
{
    if (_connections.size() < kMostConnections)
        return true;
    const auto idle = std::ranges::find_if(_connections, &PortConnection::isIdle);
    if (idle == _connections.end()) {
        systemLog(Priority::error, "Message port %s: a peer was refused, %zu are connected", _name.c_str(),
            _connections.size());
        return false;
    }
    systemLog(Priority::warning, "Message port %s: a silent peer was closed, %zu are connected",
        _name.c_str(), _connections.size());
    _connections.erase(idle);
    return true;
}

void LocalSocketPort::remove(PortConnection* connection)
{
    std::erase_if(
        _connections, [connection](const auto& candidate) { return candidate.get() == connection; });
}

void LocalSocketPort::invalidate()
{
    if (!isValid())
        return;
    close();
    // The callback may destroy the port.
    if (const auto callback = std::exchange(_invalidationCallback, {}))
        callback();
}

void LocalSocketPort::deliverWaiting()
{
    // A receiver may close the port, and a connection may end.
    std::vector<QPointer<PortConnection>> connections;
    for (const auto& connection : _connections)
        connections.emplace_back(connection.get());
    for (const auto& connection : connections) {
        if (connection)
            connection->handleWaiting();
    }
}

void LocalSocketPort::setInvalidationCallback(std::function<void()> callback)
{
    _invalidationCallback = std::move(callback);
}

void LocalSocketPort::close()
{
    if (!_server)
        return;
    // A starter that comes between the closing and the removal would lose its fresh file.
    const auto lock = _directory.lock();
    _server->close(); // removes the file
    _server.reset();
    _connections.clear();
}

} // namespace orvex
