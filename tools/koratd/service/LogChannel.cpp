#include "LogChannel.h"

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
} // namespace

std::unique_ptr<LogChannel> LogChannel::open(const Platform& platform, const Options& options,
    const std::string& clientPortName, const std::string& channelPortName)
{
    std::unique_ptr<LogChannel> channel(new LogChannel(platform, options, clientPortName));
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

LogChannel::LogChannel(const Platform& platform, const Options& options, std::string clientPortName)
    : _platform(platform)
    , _options(options)
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
    const char* technology =
        _options.faults.unknownTechnology ? kUnheardOfTechnology : _options.scenario->technology;
    return propertyListXML(Dictionary::make({{telephony::kGetTechnology, technology}}));
}

void LogChannel::startStream(const Dictionary& command)
{
    _sentBefore = sent();
    const ScenarioSettings settings{_options.seed, timeNow()};
    _streamer = std::make_unique<Streamer>(_platform.runLoop, _client, _options.scenario->make(settings),
        Subscription(command), GarbageSource(_options.faults.garbagePercent, _options.seed),
        Streamer::Pace{_options.rate, _options.count});
}

} // namespace orvex::korat
