#pragma once

#include "Source.h"

#include "PcapWriter.h"

namespace orvex::korat {

// Records what is streamed as a pcap file. A file that cannot be written, from the start or from some moment
// on (a full disk), is reported once, and nothing more is recorded. So is the first message that is too long
// for a packet of the file; the recording goes on.
class Recorder {
public:
    // An existing file is overwritten.
    explicit Recorder(const std::string& path);
    ~Recorder();
    Recorder(const Recorder&) = delete;
    Recorder& operator=(const Recorder&) = delete;

    bool isRecording() const { return _file != nullptr; }
    void write(ByteView message, Microseconds time);
    // Reports how many messages were too long for the file, if any.
    void reportCut() const;
    // Until then what was written may be in memory only.
    void flush();

private:
    void stopAfterError();

    std::unique_ptr<PcapWriter> _file;
    std::size_t _cut = 0; // messages of which the file has the beginning only
};

} // namespace orvex::korat
