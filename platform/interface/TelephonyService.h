#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvex {

// A connection to the handset's telephony service, which owns the baseband.
class TelephonyConnection {
public:
    struct LogChannelReply {
        std::int32_t errorDomain = 0;
        long errorCode = 0; // 0 is success; an errno value when the service could not be asked
        std::optional<std::string> remotePortName;
        std::string failure = {}; // why the service could not be asked; empty when it answered
    };

    virtual ~TelephonyConnection() = default;

    // Asks the service to open the network-monitor log channel to the named local port.
    virtual LogChannelReply createNetworkMonitorLogChannel(const std::string& localPortName) = 0;
};

class TelephonyService {
public:
    virtual ~TelephonyService() = default;

    // Null when the service is not running. As long as the connection lives, the callback reports each change
    // that the service notifies it of.
    virtual std::unique_ptr<TelephonyConnection> connect(std::function<void()> onNotification) = 0;
};

} // namespace orvex
