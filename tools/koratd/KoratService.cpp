#include "KoratService.h"

#include "Report.h"

#include "Dictionary.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

#include <cerrno>
#include <string_view>
#include <unistd.h>

namespace orvex::korat {

namespace {
constexpr std::chrono::milliseconds kWatchPeriod{100};
constexpr const char* kChannelPortPrefix = "org.orvex.Korat.LogChannel.";
constexpr const char* kUnheardOfTechnology = "MRL_UNHEARD_OF";
constexpr std::string_view kNoPropertyList = "\x01\x02 this is no property list";

// Errors are errno values, which is the error domain 0.
Bytes channelReply(int errorCode, const std::string& channelPortName = {})
{
    return propertyListXML(Dictionary::make({
                               {telephony::kErrorDomain, 0},
                               {telephony::kErrorCode, errorCode},
                               {telephony::kRemotePortName, channelPortName},
                           }))
        .value_or(Bytes{});
}

Microseconds timeNow()
{
    return std::chrono::duration_cast<Microseconds>(std::chrono::system_clock::now().time_since_epoch());
}
} // namespace

std::unique_ptr<LogChannel> LogChannel::open(const Platform& platform, const Options& options, Feed& feed,
    Recorder* recorder, const std::string& clientPortName, const std::string& channelPortName)
{
    std::unique_ptr<LogChannel> channel(new LogChannel(platform, options, feed, recorder, clientPortName));
    channel->_client = platform.ports.createRemotePort(clientPortName);
    if (!channel->_client)
        return nullptr;
    // The port dies with the channel, so its receiver needs no hold on it.
    auto local = platform.ports.createLocalPort(
        channelPortName, [self = channel.get()](std::int32_t messageId, ByteView data) {
            return self->receive(messageId, data);
        });
    if (!local.port || local.alreadyExisted)
        return nullptr;
    channel->_port = std::move(local.port);
    return channel;
}

LogChannel::LogChannel(const Platform& platform, const Options& options, Feed& feed, Recorder* recorder,
    std::string clientPortName)
    : _platform(platform)
    , _options(options)
    , _feed(feed)
    , _technology(feed.technology())
    , _recorder(recorder)
    , _clientPortName(std::move(clientPortName))
{
}

LogChannel::~LogChannel()
{
    if (_client)
        _client->invalidate();
    if (_port)
        _port->invalidate();
}

std::optional<Bytes> LogChannel::receive(std::int32_t messageId, ByteView data)
{
    if (messageId != telephony::kLogChannelMessageId)
        return std::nullopt;
    const auto parsed = propertyListFromData(data);
    const DictionaryRef command = parsed.value ? parsed.value->dictionary() : nullptr;
    if (!command)
        return std::nullopt;
    if (command->contains(telephony::kGetTechnology))
        return technologyReply();
    if (Subscription::isStartCommand(*command))
        startStream(*command);
    return std::nullopt;
}

std::optional<Bytes> LogChannel::technologyReply() const
{
    if (_options.faults.noReply)
        return std::nullopt;
    if (_options.faults.badReply)
        return Bytes(kNoPropertyList.begin(), kNoPropertyList.end());
    const std::string technology = _options.faults.unknownTechnology ? kUnheardOfTechnology : _technology;
    return propertyListXML(Dictionary::make({{telephony::kGetTechnology, technology}}));
}

void LogChannel::startStream(const Dictionary& command)
{
    _sentBefore = sent();
    const Microseconds start = timeNow();
    Streamer::Listener listener;
    if (_recorder) {
        listener = [recorder = _recorder, start](
                       const Message& message) { recorder->write(message.bytes, start + message.due); };
    }
    _streamer = std::make_unique<Streamer>(_platform.runLoop, _client, _feed.open(_technology),
        Subscription(command), GarbageSource(_options.faults.garbagePercent),
        Streamer::Pace{_options.rate, _options.count}, std::move(listener));
}

KoratService::KoratService(
    const LogChannel::Platform& platform, const Options& options, std::unique_ptr<Feed> feed)
    : _platform(platform)
    , _options(options)
    , _feed(std::move(feed))
{
}

KoratService::~KoratService()
{
    stop();
}

bool KoratService::start()
{
    if (const std::string fault = _feed->start(); !fault.empty()) {
        report("%s", fault.c_str());
        return false;
    }
    auto local = _platform.ports.createLocalPort(telephony::kServicePortName,
        [this](std::int32_t messageId, ByteView data) { return receive(messageId, data); });
    if (!local.port || local.alreadyExisted) {
        reportText(local.alreadyExisted ? "another service is running already"
                                        : text("the port %s cannot be created", telephony::kServicePortName));
        return false;
    }
    _port = std::move(local.port);
    if (_options.record) { // not earlier: another koratd may be writing that file
        _recorder = std::make_unique<Recorder>(*_options.record);
        if (!_recorder->isRecording())
            return false;
    }
    _watch = _platform.runLoop.startTimer(kWatchPeriod, [this] { watch(); });
    return true;
}

void KoratService::watch()
{
    if (_channel && !_channel->isClientThere())
        closeChannel();
    if (_channel && _channel->technology() != _feed->technology()) // the client asks for it again
        closeChannel("has to ask for the technology again");
    if (_recorder)
        _recorder->flush();
}

void KoratService::stop()
{
    _watch.reset();
    closeChannel();
    _recorder.reset();
    if (_port)
        _port->invalidate();
    _port.reset();
}

void KoratService::reportSent() const
{
    const std::uint64_t sent = _sentBefore + (_channel ? _channel->sent() : 0);
    report("sent %zu messages", sent);
    if (_recorder)
        _recorder->reportCut();
    if (const std::size_t pending = _channel ? _channel->pendingBytes() : 0; pending > 0)
        report("the client has not taken the last %zu bytes", pending);
}

std::optional<Bytes> KoratService::receive(std::int32_t messageId, ByteView data)
{
    if (messageId != telephony::kCreateLogChannelMessageId)
        return std::nullopt;
    const auto parsed = propertyListFromData(data);
    const DictionaryRef request = parsed.value ? parsed.value->dictionary() : nullptr;
    if (!request || (*request)[telephony::kRequest] != Value(telephony::kCreateLogChannelRequest))
        return channelReply(EINVAL);
    const std::string* clientPortName = (*request)[telephony::kPortName].string();
    return clientPortName ? openChannel(*clientPortName) : channelReply(EINVAL);
}

Bytes KoratService::openChannel(const std::string& clientPortName)
{
    if (_options.faults.refuseChannel)
        return channelReply(*_options.faults.refuseChannel);
    if (_options.faults.nullPort)
        return channelReply(0);
    if (clientPortName == telephony::kServicePortName || clientPortName.starts_with(kChannelPortPrefix)) {
        report("refused %s: it is a port of this service", clientPortName.c_str());
        return channelReply(EINVAL);
    }
    // It may have gone since the last look.
    if (_channel && !_channel->isClientThere())
        closeChannel();
    if (_channel) {
        report("refused %s: %s is being served", clientPortName.c_str(), _channel->clientPortName().c_str());
        return channelReply(EBUSY);
    }
    const std::string channelPortName = kChannelPortPrefix + std::to_string(++_channelNumber);
    _feed->setMonitored(true);
    _channel =
        LogChannel::open(_platform, _options, *_feed, _recorder.get(), clientPortName, channelPortName);
    if (!_channel) {
        _feed->setMonitored(false);
        return channelReply(ENOENT);
    }
    report("serving %s", clientPortName.c_str());
    armDeath();
    return channelReply(0, channelPortName);
}

void KoratService::closeChannel(const char* why)
{
    if (!_channel)
        return;
    report("%s %s; sent %zu messages to it", _channel->clientPortName().c_str(), why, _channel->sent());
    _sentBefore += _channel->sent();
    _channel.reset();
    _feed->setMonitored(false);
}

void KoratService::armDeath()
{
    if (!_options.faults.dieAfter || _channelNumber != 1)
        return;
    _platform.runLoop.postAfter(*_options.faults.dieAfter, [this] {
        report("dying, as asked");
        reportSent();
        ::_exit(1);
    });
}

} // namespace orvex::korat
