#pragma once

#include "MessagePort.h"
#include "TelephonyService.h"

namespace orvex {

// The telephony service, reached through its message port. The ports outlive the service and its connections.
//
// onNotification is never called: the service knows no port of the connection's, and message ports carry
// nothing but replies back.
class KoratTelephonyService final : public TelephonyService {
public:
    explicit KoratTelephonyService(MessagePorts& ports)
        : _ports(ports)
    {
    }

    std::unique_ptr<TelephonyConnection> connect(std::function<void()> onNotification) override;

private:
    MessagePorts& _ports;
};

} // namespace orvex
