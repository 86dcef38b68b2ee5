#pragma once

#include "CaptureFile.h"
#include "CaptureReader.h"

namespace orvex {

// Reads a pcap file of either byte order, with micro- or nanoseconds, link type 147 (USER0): one message per
// packet, exactly as on the log channel.
class PcapReader final : public CaptureReader {
public:
    PcapReader(const std::string& path, std::unique_ptr<CaptureFile> file);
    ~PcapReader() override;

    Status next() override;
    std::string omissions() const override;

private:
    struct Pcap;

    std::unique_ptr<CaptureFile> _file;
    std::unique_ptr<Pcap> _pcap;        // null if the file cannot be read
    std::size_t _incompletePackets = 0; // cut by the capture's snapshot length
};

} // namespace orvex
