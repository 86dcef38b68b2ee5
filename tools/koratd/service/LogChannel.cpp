#include "LogChannel.h"

#include "replay/ReplaySource.h"

#include "Dictionary.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"

#include <string_view>

namespace orvex::korat {

namespace {
constexpr std::int32_t kChannelMessageId = 0;
constexpr const char* kUnheardOfTechnology = "MRL_UNHEARD_OF";
constexpr std::string_view kNoPropertyList = "\x01\x02 this is no property list";

Microseconds timeNow()
{
    return std::chrono::duration_cast<Microseconds>(std::chrono::system_clock::now().time_since_epoch());
}

std::unique_ptr<MessageSource> sourceFor(const Options& options, Microseconds start)
{
    if (options.replay)
        return std::make_unique<ReplaySource>(*options.replay, options.isLooped);
    return options.scenario->make({options.seed, start});
}
} // namespace

std::unique_ptr<LogChannel> LogChannel::open(const Platform& platform, const Options& options,
    Recorder* recorder, const std::string& clientPortName, const std::string& channelPortName)
{
    std::unique_ptr<LogChannel> channel(new LogChannel(platform, options, recorder, clientPortName));
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

LogChannel::LogChannel(
    const Platform& platform, const Options& options, Recorder* recorder, std::string clientPortName)
    : _platform(platform)
    , _options(options)
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
    if (messageId != kChannelMessageId)
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
    const std::string technology =
        _options.faults.unknownTechnology ? kUnheardOfTechnology : _options.technology;
    return propertyListXML(Dictionary::make({{telephony::kGetTechnology, technology}}));
}

void LogChannel::startStream(const Dictionary& command)
{
    _sentBefore = sent();
    const Microseconds start = timeNow();
    Streamer::Listener listener;
    if (_recorder) {
        listener = [recorder = _recorder, start](const MessageSource::Item& item) {
            recorder->write(item.message.bytes, start + item.due);
        };
    }
    _streamer = std::make_unique<Streamer>(_platform.runLoop, _client, sourceFor(_options, start),
        Subscription(command), GarbageSource(_options.faults.garbagePercent, _options.seed),
        Streamer::Pace{_options.rate, _options.count}, std::move(listener));
}

} // namespace orvex::korat
