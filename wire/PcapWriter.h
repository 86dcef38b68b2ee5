#pragma once

#include "Value.h"

#include <chrono>
#include <memory>
#include <string>

namespace orvex {

// Writes log messages as a pcap file with microseconds and link type 147 (USER0), one message per packet.
// After the first failure nothing more is written.
class PcapWriter {
public:
    // Readers refuse a file with a longer packet. Of a longer message the beginning is written, and its true
    // length; readers leave it out.
    static constexpr std::size_t kLongestPacket = 262'144;

    // An existing file is overwritten.
    explicit PcapWriter(const std::string& path);
    ~PcapWriter();
    PcapWriter(const PcapWriter&) = delete;
    PcapWriter& operator=(const PcapWriter&) = delete;

    void write(ByteView message, std::chrono::microseconds time);
    void flush();

    // One line with the file's path; empty while everything could be written.
    const std::string& error() const { return _error; }

private:
    struct Dump;

    std::string _path;
    std::unique_ptr<Dump> _dump; // null when the file cannot be written
    std::string _error;
};

} // namespace orvex
