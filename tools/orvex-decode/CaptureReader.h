#pragma once

#include "MessagePort.h"

#include <memory>
#include <string>

namespace orvex {

// The log messages of a capture file: a pcap file of either byte order, with micro- or nanoseconds, link type
// 147 (USER0), one message per packet exactly as it stands on the log channel.
class CaptureReader {
public:
    enum class Status {
        message, // message() holds the next one
        end,     // there are no more
        broken,  // the file cannot be read (on); error() says why. What came before stays good.
    };

    explicit CaptureReader(const std::string& path);
    ~CaptureReader();
    CaptureReader(const CaptureReader&) = delete;
    CaptureReader& operator=(const CaptureReader&) = delete;

    Status next();

    // Holds until the next call of next().
    ByteView message() const { return _message; }
    // One line with the file's path.
    const std::string& error() const { return _error; }
    // Packets left out because the capture holds only their beginning.
    std::size_t incompletePackets() const { return _incompletePackets; }

private:
    struct Pcap;

    Status breakOff(const std::string& reason);

    std::string _path;
    std::unique_ptr<Pcap> _pcap; // null when the file cannot be read
    ByteView _message;
    std::string _error;
    std::size_t _incompletePackets = 0;
};

} // namespace orvex
