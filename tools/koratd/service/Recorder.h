#pragma once

#include "packets/LogMessage.h"

#include "PcapWriter.h"

namespace orvex::korat {

// Records what is streamed as a pcap file. A file that cannot be written, from the start or from some moment
// on (a full disk), is reported once, and nothing more is recorded.
class Recorder {
public:
    // An existing file is overwritten.
    explicit Recorder(const std::string& path);
    ~Recorder();
    Recorder(const Recorder&) = delete;
    Recorder& operator=(const Recorder&) = delete;

    bool isRecording() const { return _file != nullptr; }
    void write(ByteView message, Microseconds time);
    // Until then what was written may be in memory only.
    void flush();

private:
    void stopAfterError();

    std::unique_ptr<PcapWriter> _file;
};

} // namespace orvex::korat
