#pragma once

#include <memory>
#include <optional>
#include <string>

namespace orvex {

// The directory of the sockets of named message ports. Whoever can write to it can impersonate any port, so
// it must belong to this user alone.
class PortDirectory {
public:
    // $ORVEX_PORT_DIR, else $XDG_RUNTIME_DIR/orvex, else /tmp/orvex-UID.
    PortDirectory();
    explicit PortDirectory(std::string path)
        : _path(std::move(path))
    {
    }

    const std::string& path() const { return _path; }

    // Creates the directory if it is absent. Why it cannot be used: that fails, or the directory is a
    // symbolic link, something else, another user's or open to others. Empty when all is well.
    std::string fault() const;
    // False, with a line in the system log, when there is a fault.
    bool isUsable() const;

    // The socket file of a port. None, with a line in the system log, when the name is empty, leads out of
    // the directory, holds characters that cannot be shown or makes a path too long for a socket.
    std::optional<std::string> socketPath(const std::string& portName) const;

    // Whoever adds or removes sockets holds the lock meanwhile. The last reference releases it. Null, with a
    // line in the system log, on failure.
    std::shared_ptr<const void> lock() const;

private:
    std::string _path;
};

} // namespace orvex
