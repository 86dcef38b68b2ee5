#pragma once

#include "MessagePort.h"
#include "TelephonyService.h"

namespace orvex {

// The telephony service behind its message port. The referent outlives the service and its connections.
//
// The service never notifies a connection: the port it would have to do so on is the one that was asked, and
// message ports carry nothing but replies that way. onNotification is therefore never called.
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
