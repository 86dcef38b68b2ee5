#pragma once

#include "LogChannel.h"

namespace orvex::korat {

// The telephony service as monitors see it: a port that opens log channels. It serves one client at a time,
// any number of them one after another.
class KoratService {
public:
    KoratService(const LogChannel::Platform& platform, const Options& options);
    ~KoratService();
    KoratService(const KoratService&) = delete;
    KoratService& operator=(const KoratService&) = delete;

    // Serves the port. False when it cannot be had, the capture to replay cannot be read or the one to record
    // cannot be written; why is reported.
    bool start();
    // Closes all ports and the recorded capture.
    void stop();

    // Reports how many messages were sent to all clients together, and what has not reached the present one.
    void reportSent() const;

private:
    std::optional<Bytes> receive(std::int32_t messageId, ByteView data);
    Bytes openChannel(const std::string& clientPortName);
    void closeChannel();
    void armDeath();

    LogChannel::Platform _platform;
    Options _options;
    std::shared_ptr<LocalPort> _port;
    std::unique_ptr<Recorder> _recorder; // outlives the channels
    std::unique_ptr<LogChannel> _channel;
    std::uint64_t _sentBefore = 0; // over channels that are closed
    int _channelNumber = 0;
    std::unique_ptr<RunLoop::Timer> _watch; // for a client that has gone, and on the disk
};

} // namespace orvex::korat
