#include "LocalSocketPort.h"

#include "SystemLog.h"

#include <QLocalSocket>
#include <QPointer>
#include <QTimer>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <tuple>
#include <utility>

#include <poll.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

namespace orvex {

namespace {
using namespace std::chrono_literals;

constexpr std::size_t kMostConnections = 16;
constexpr std::size_t kMostPartialBytes = std::size_t{64} << 20;
constexpr auto kIdle = 1s; // without a message; then a peer may be replaced
constexpr int kBacklog = 64;
constexpr int kPeersPerTurn = 64;
constexpr auto kPause = 500ms; // after running out of descriptors

int makeSocket()
{
    return socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
}

sockaddr_un addressOf(const std::string& path)
{
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    path.copy(address.sun_path, sizeof address.sun_path - 1);
    return address;
}

// A socket that listens under the path; -1 with errno on failure.
int listenAt(const std::string& path)
{
    const int listener = makeSocket();
    if (listener < 0)
        return -1;
    const sockaddr_un address = addressOf(path);
    if (bind(listener, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0
        && listen(listener, kBacklog) == 0)
        return listener;
    const int error = errno;
    close(listener);
    errno = error;
    return -1;
}

// The error of a connection attempt to the socket; 0 when somebody listens there.
int connectionError(const std::string& path)
{
    const int probe = makeSocket();
    if (probe < 0)
        return errno;
    const sockaddr_un address = addressOf(path);
    const auto* generic = reinterpret_cast<const sockaddr*>(&address);
    const int error = connect(probe, generic, sizeof address) == 0 ? 0 : errno;
    close(probe);
    return error == EAGAIN || error == EINPROGRESS ? 0 : error; // the listener is busy
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
    const auto lock = _directory.lock(); // two processes may find the same stale file
    if (!lock)
        return ListenResult::failed;
    const int error = connectionError(*path);
    if (error == 0)
        return ListenResult::alreadyExists;
    if (error == ECONNREFUSED && isSocketFile(*path))
        unlink(path->c_str());

    const int listener = listenAt(*path);
    if (listener < 0) {
        systemLog(Priority::error, "Message port %s: %s", _name.c_str(), std::strerror(errno));
        return ListenResult::failed;
    }
    _listener = std::make_unique<QSocketNotifier>(listener, QSocketNotifier::Read);
    QObject::connect(
        _listener.get(), &QSocketNotifier::activated, _listener.get(), [this] { acceptPeers(); });
    return ListenResult::listening;
}

void LocalSocketPort::acceptPeers()
{
    for (int i = 0; i < kPeersPerTurn; ++i) {
        const int peer =
            accept4(static_cast<int>(_listener->socket()), nullptr, nullptr, SOCK_CLOEXEC | SOCK_NONBLOCK);
        if (peer < 0) {
            const int error = errno;
            const bool isShort = error == EMFILE || error == ENFILE || error == ENOMEM || error == ENOBUFS;
            if (isShort && isPeerWaiting()) // accept4() wants a descriptor even if no peer waits
                pauseListening(error);
            return;
        }
        if (std::exchange(_isShortOfDescriptors, false))
            systemLog(Priority::warning, "Message port %s: accepting peers again", _name.c_str());
        auto socket = std::make_unique<QLocalSocket>();
        if (!socket->setSocketDescriptor(peer)) {
            ::close(peer);
            continue;
        }
        if (isWelcome(*socket) && makeRoom())
            _connections.push_back(std::make_unique<PortConnection>(
                _name, std::move(socket), _receiver,
                [this](PortConnection* connection) { remove(connection); },
                [this] { boundPartialMessages(); }));
    }
}

bool LocalSocketPort::isPeerWaiting() const
{
    pollfd listener{.fd = static_cast<int>(_listener->socket()), .events = POLLIN, .revents = 0};
    return ::poll(&listener, 1, 0) > 0;
}

void LocalSocketPort::pauseListening(int error)
{
    // The peer keeps waiting. Without a pause the event loop would spin on its attempts.
    if (!std::exchange(_isShortOfDescriptors, true))
        systemLog(Priority::error, "Message port %s: cannot accept a peer: %s", _name.c_str(),
            std::strerror(error)); // NOLINT(concurrency-mt-unsafe)
    _listener->setEnabled(false);
    QTimer::singleShot(kPause, _listener.get(), [this] { _listener->setEnabled(true); });
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
    // Those that have never sent a message go first; among equals, the one that has been idle for longest.
    const auto rank = [](const auto& connection) {
        return std::tuple(!connection->isHandling(), !connection->hasSpoken(), connection->idleTime());
    };
    const auto idle = std::ranges::max_element(_connections, {}, rank);
    const bool isIdle = !(*idle)->hasSpoken() || (*idle)->idleTime() >= kIdle;
    if ((*idle)->isHandling() || !isIdle) {
        systemLog(Priority::error, "Message port %s: a peer was refused, %zu are connected", _name.c_str(),
            _connections.size());
        return false;
    }
    systemLog(Priority::warning, "Message port %s: an idle peer was closed, %zu are connected", _name.c_str(),
        _connections.size());
    _connections.erase(idle);
    return true;
}

void LocalSocketPort::boundPartialMessages()
{
    std::size_t total = 0;
    for (const auto& connection : _connections)
        total += connection->partialBytes();
    while (total > kMostPartialBytes) {
        const auto rank = [](const auto& connection) {
            const bool mayGo = connection->partialBytes() > 0 && !connection->isHandling();
            return std::pair(mayGo, connection->idleTime());
        };
        const auto slowest = std::ranges::max_element(_connections, {}, rank);
        systemLog(Priority::error, "Message port %s: a peer inside a message was closed, %zu bytes wait",
            _name.c_str(), total);
        total -= (*slowest)->partialBytes();
        _connections.erase(slowest);
    }
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
    // A receiver may close the port, and connections may end meanwhile.
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
    if (!_listener)
        return;
    // Without the lock, a process that starts to listen between close and unlink would lose its new file.
    const auto lock = _directory.lock();
    const int listener = static_cast<int>(_listener->socket());
    _listener.reset();
    ::close(listener);
    if (const auto path = _directory.socketPath(_name))
        unlink(path->c_str());
    _connections.clear();
}

} // namespace orvex
