#include "KoratTelephonyService.h"

#include "Dictionary.h"
#include "PropertyList.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"
#include "VisibleText.h"

#include <cerrno>
#include <limits>
#include <utility>

namespace orvex {

namespace {
using namespace std::chrono_literals;

constexpr auto kSendTimeout = 1s;
constexpr auto kReceiveTimeout = 1s;

TelephonyConnection::LogChannelReply failure(int error, const std::string& why)
{
    const std::string shown = visibleText(why);
    systemLog(Priority::error, "Telephony service: %s", shown.c_str());
    return {0, error, std::nullopt, shown};
}

class KoratConnection final : public TelephonyConnection {
public:
    explicit KoratConnection(std::shared_ptr<RemotePort> port)
        : _port(std::move(port))
    {
    }

    LogChannelReply createNetworkMonitorLogChannel(const std::string& localPortName) override
    {
        const auto question = propertyListXML(Dictionary::make({
            {telephony::kRequest, telephony::kCreateLogChannelRequest},
            {telephony::kPortName, localPortName},
        }));
        if (!question)
            return failure(EINVAL, "the request for a log channel cannot be encoded");
        const auto sent =
            _port->request(telephony::kCreateLogChannelMessageId, *question, kSendTimeout, kReceiveTimeout);
        switch (sent.status) {
        case RemotePort::Status::success: break;
        case RemotePort::Status::sendTimeout: return failure(ETIMEDOUT, "it does not take the request");
        default: return failure(EPIPE, "the request could not be sent");
        }
        if (!sent.reply)
            return _port->isValid() ? failure(ETIMEDOUT, "no reply in time")
                                    : failure(ECONNRESET, "it ended without a reply");
        return replyFrom(*sent.reply);
    }

private:
    static LogChannelReply replyFrom(const Bytes& data)
    {
        const auto list = propertyListFromData(data);
        if (!list.value)
            return failure(EPROTO, "its reply cannot be read. " + list.error);
        const auto answer = list.value->dictionary();
        const auto* code = answer ? (*answer)[telephony::kErrorCode].integer() : nullptr;
        if (!code)
            return failure(EPROTO, "its reply has no error code");
        LogChannelReply reply;
        reply.errorCode = *code;
        const auto* domain = (*answer)[telephony::kErrorDomain].integer();
        if (domain && std::in_range<std::int32_t>(*domain))
            reply.errorDomain = static_cast<std::int32_t>(*domain);
        if (const auto* name = (*answer)[telephony::kRemotePortName].string())
            reply.remotePortName = *name;
        return reply;
    }

    std::shared_ptr<RemotePort> _port;
};
} // namespace

std::unique_ptr<TelephonyConnection> KoratTelephonyService::connect(std::function<void()> /*onNotification*/)
{
    auto port = _ports.createRemotePort(telephony::kServicePortName);
    return port ? std::make_unique<KoratConnection>(std::move(port)) : nullptr;
}

} // namespace orvex
