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
    };

    virtual ~TelephonyConnection() = default;

    // Asks the service to open the network-monitor log channel towards the named local port.
    virtual LogChannelReply createNetworkMonitorLogChannel(const std::string& localPortName) = 0;
};

class TelephonyService {
public:
    virtual ~TelephonyService() = default;

    // Null when the service is not there. The callback is called whenever the service notifies this
    // connection of a change, for as long as the connection lives.
    virtual std::unique_ptr<TelephonyConnection> connect(std::function<void()> onNotification) = 0;
};

} // namespace orvex
