#pragma once

#include "Value.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvex {

// One end of a message channel between processes.
class MessagePort {
public:
    virtual ~MessagePort() = default;

    // False once the port has been invalidated or, for a remote port, its peer has gone.
    virtual bool isValid() const = 0;
    // Closes the port for good, then calls the invalidation callback, once. The callback may destroy the port
    // if the caller of invalidate() holds a reference to it.
    virtual void invalidate() = 0;
    // An empty callback clears it.
    virtual void setInvalidationCallback(std::function<void()> callback) = 0;
};

// The receiving end. Messages arrive on the run loop, in the order in which their sender sent them.
class LocalPort : public MessagePort {
public:
    // Delivers now what has arrived and waits for the run loop; a port that closes drops it.
    virtual void deliverWaiting() { }
};

// The sending end.
class RemotePort : public MessagePort {
public:
    enum class Status : int { success = 0, sendTimeout = -1, invalid = -3, transportError = -4 };

    struct SendResult {
        Status status = Status::success; // of the sending alone
        std::optional<Bytes> reply;      // none when none was wanted or none came in time
    };

    // Sends a message that wants no reply. Waits up to the timeout while the peer does not read.
    virtual Status send(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout) = 0;
    // Sends a request and waits for its reply, without running the run loop.
    virtual SendResult request(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout,
        std::chrono::milliseconds receiveTimeout) = 0;
    // Bytes accepted for sending that have not reached the socket yet.
    virtual std::size_t pendingBytes() const = 0;
};

// Creates ports by name.
class MessagePorts {
public:
    // Receives a local port's messages. The bytes returned are the reply to a request; none means no reply.
    using Receiver = std::function<std::optional<Bytes>(std::int32_t messageId, ByteView data)>;

    struct LocalPortResult {
        std::shared_ptr<LocalPort> port; // null when it could not be created
        bool alreadyExisted = false;     // the name is taken; the port receives nothing
    };

    virtual ~MessagePorts() = default;

    virtual LocalPortResult createLocalPort(const std::string& name, Receiver receiver) = 0;
    // Null when nobody listens under the name.
    virtual std::shared_ptr<RemotePort> createRemotePort(const std::string& name) = 0;
};

} // namespace orvex
