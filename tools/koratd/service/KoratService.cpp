#include "KoratService.h"

#include "Report.h"

#include "replay/ReplaySource.h"

#include "Dictionary.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"
#include "TextFormat.h"

#include <cerrno>
#include <unistd.h>

namespace orvex::korat {

namespace {
constexpr std::chrono::milliseconds kWatchPeriod{100};
constexpr const char* kChannelPortPrefix = "org.orvex.Korat.LogChannel.";

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
} // namespace

KoratService::KoratService(const LogChannel::Platform& platform, const Options& options)
    : _platform(platform)
    , _options(options)
{
}

KoratService::~KoratService()
{
    stop();
}

bool KoratService::start()
{
    const std::string fault = _options.replay ? ReplaySource::faultOf(*_options.replay) : std::string();
    if (!fault.empty()) {
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
    _watch = _platform.runLoop.startTimer(kWatchPeriod, [this] {
        if (_channel && !_channel->isClientThere())
            closeChannel();
        if (_recorder)
            _recorder->flush();
    });
    return true;
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
    _channel = LogChannel::open(_platform, _options, _recorder.get(), clientPortName, channelPortName);
    if (!_channel)
        return channelReply(ENOENT);
    report("serving %s", clientPortName.c_str());
    armDeath();
    return channelReply(0, channelPortName);
}

void KoratService::closeChannel()
{
    if (!_channel)
        return;
    report("%s has left; sent %zu messages to it", _channel->clientPortName().c_str(), _channel->sent());
    _sentBefore += _channel->sent();
    _channel.reset();
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
