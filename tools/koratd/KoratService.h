#pragma once

#include "Options.h"
#include "Recorder.h"
#include "Streamer.h"

namespace orvex::korat {

// One client's log channel: tells it the technology and, after its start command, streams to it.
class LogChannel {
public:
    struct Platform {
        RunLoop& runLoop;
        MessagePorts& ports;
    };

    // Opens the way to the client's port and serves a port of the given name. Null when one of the two fails.
    // What is streamed goes to the recorder too, when there is one.
    static std::unique_ptr<LogChannel> open(const Platform& platform, const Options& options, Feed& feed,
        Recorder* recorder, const std::string& clientPortName, const std::string& channelPortName);

    ~LogChannel();
    LogChannel(const LogChannel&) = delete;
    LogChannel& operator=(const LogChannel&) = delete;

    bool isClientThere() const { return _client->isValid(); }
    const std::string& clientPortName() const { return _clientPortName; }
    // What the client is told, as long as the channel is open.
    const std::string& technology() const { return _technology; }
    // Bytes sent that the client has not taken yet.
    std::size_t pendingBytes() const { return _client->pendingBytes(); }
    std::uint64_t sent() const { return _sentBefore + (_streamer ? _streamer->sent() : 0); }

private:
    LogChannel(const Platform& platform, const Options& options, Feed& feed, Recorder* recorder,
        std::string clientPortName);

    std::optional<Bytes> receive(std::int32_t messageId, ByteView data);
    std::optional<Bytes> technologyReply() const;
    void startStream(const Dictionary& command);

    Platform _platform;
    Options _options;
    Feed& _feed;
    std::string _technology;
    Recorder* _recorder;
    std::string _clientPortName;
    std::shared_ptr<RemotePort> _client;
    std::shared_ptr<LocalPort> _port;
    std::unique_ptr<Streamer> _streamer; // once the client has sent its start command
    std::uint64_t _sentBefore = 0;       // by streams that a later start command ended
};

// The telephony service as monitors see it: a port that opens log channels. It serves one client at a time,
// any number of them one after another.
class KoratService {
public:
    KoratService(const LogChannel::Platform& platform, const Options& options, std::unique_ptr<Feed> feed);
    ~KoratService();
    KoratService(const KoratService&) = delete;
    KoratService& operator=(const KoratService&) = delete;

    // Serves the port. False when it cannot be had, or the feed cannot start, or the recording cannot be
    // written; why is reported.
    bool start();
    // Closes all ports and the recording.
    void stop();

    // Reports how many messages were sent to all clients together, and what has not reached the present one.
    void reportSent() const;

private:
    std::optional<Bytes> receive(std::int32_t messageId, ByteView data);
    Bytes openChannel(const std::string& clientPortName);
    void watch();
    void closeChannel(const char* why = "has left");
    void armDeath();

    LogChannel::Platform _platform;
    Options _options;
    std::unique_ptr<Feed> _feed; // outlives the channels, as the next
    std::shared_ptr<LocalPort> _port;
    std::unique_ptr<Recorder> _recorder;
    std::unique_ptr<LogChannel> _channel;
    std::uint64_t _sentBefore = 0; // over channels that are closed
    int _channelNumber = 0;
    std::unique_ptr<RunLoop::Timer> _watch; // for a client that has gone, a new technology, and on the disk
};

} // namespace orvex::korat
