#pragma once

#include <memory>
#include <optional>
#include <string>

namespace orvex {

// The directory that holds the sockets of named message ports. Whoever can write there can pretend to be any
// port, so it must belong to this user alone.
class PortDirectory {
public:
    // $ORVEX_PORT_DIR, else $XDG_RUNTIME_DIR/orvex, else /tmp/orvex-UID.
    PortDirectory();
    explicit PortDirectory(std::string path)
        : _path(std::move(path))
    {
    }

    const std::string& path() const { return _path; }

    // Makes the directory when it is absent. False, with a line in the system log, when it cannot be made, is
    // a symbolic link or no directory, belongs to another user or is open to others.
    bool isUsable() const;

    // The socket file of a port. None, with a line in the system log, when the name is empty, leads out of
    // the directory or makes a path longer than a socket can have.
    std::optional<std::string> socketPath(const std::string& portName) const;

    // While it is held, no other process that holds one adds or removes sockets. It is released with the last
    // reference. Null, with a line in the system log, when the directory cannot be locked.
    std::shared_ptr<const void> lock() const;

private:
    std::string _path;
};

} // namespace orvex
