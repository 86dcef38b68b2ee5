#pragma once

#include "Recorder.h"
#include "Streamer.h"

#include "Options.h"

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
    static std::unique_ptr<LogChannel> open(const Platform& platform, const Options& options,
        Recorder* recorder, const std::string& clientPortName, const std::string& channelPortName);

    ~LogChannel();
    LogChannel(const LogChannel&) = delete;
    LogChannel& operator=(const LogChannel&) = delete;

    bool isClientThere() const { return _client->isValid(); }
    const std::string& clientPortName() const { return _clientPortName; }
    // Bytes sent that the client has not taken yet.
    std::size_t pendingBytes() const { return _client->pendingBytes(); }
    std::uint64_t sent() const { return _sentBefore + (_streamer ? _streamer->sent() : 0); }

private:
    LogChannel(
        const Platform& platform, const Options& options, Recorder* recorder, std::string clientPortName);

    std::optional<Bytes> receive(std::int32_t messageId, ByteView data);
    std::optional<Bytes> technologyReply() const;
    void startStream(const Dictionary& command);

    Platform _platform;
    Options _options;
    Recorder* _recorder;
    std::string _clientPortName;
    std::shared_ptr<RemotePort> _client;
    std::shared_ptr<LocalPort> _port;
    std::unique_ptr<Streamer> _streamer; // once the client has sent its start command
    std::uint64_t _sentBefore = 0;       // by streams that a later start command ended
};

} // namespace orvex::korat
