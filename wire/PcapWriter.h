#pragma once

#include "Value.h"

#include <chrono>
#include <memory>
#include <string>

namespace orvex {

// Writes log messages as a pcap file with microseconds and link type 147 (USER0), one message per packet.
// Stops at the first failure.
class PcapWriter {
public:
    // Readers refuse files with longer packets. A longer message is written cut, with its true length;
    // readers skip it.
    static constexpr std::size_t kLongestPacket = 262'144;

    // Overwrites an existing file.
    explicit PcapWriter(const std::string& path);
    ~PcapWriter();
    PcapWriter(const PcapWriter&) = delete;
    PcapWriter& operator=(const PcapWriter&) = delete;

    void write(ByteView message, std::chrono::microseconds time);
    void flush();

    // One line that includes the path; empty if there is no error.
    const std::string& error() const { return _error; }

private:
    struct Dump;

    std::string _path;
    std::unique_ptr<Dump> _dump; // null if the file cannot be written
    std::string _error;
};

} // namespace orvex
