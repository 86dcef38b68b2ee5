#pragma once

#include "KoratTelephonyService.h"
#include "PropertyList.h"
#include "SocketMessagePorts.h"

#include "Dictionary.h"

#include <cerrno>
#include <vector>

namespace orvex::test {

// A client of the service inside the test, on the real ports.
class KoratClient {
public:
    explicit KoratClient(
        const std::string& portDirectory, const std::string& portName = "org.orvex.Test.Client")
        : _ports(portDirectory)
        , _portName(portName)
    {
    }

    // Asks for a log channel; 0 is success.
    long open()
    {
        _port.reset(); // a name has one owner
        const auto receiver = [this](std::int32_t messageId, ByteView data) {
            if (messageId == 0)
                messages.emplace_back(data.begin(), data.end());
            return std::nullopt;
        };
        _port = _ports.createLocalPort(_portName, receiver).port;
        const auto connection = KoratTelephonyService(_ports).connect([] {});
        if (!connection)
            return ECONNREFUSED;
        const auto channel = connection->createNetworkMonitorLogChannel(_portName);
        if (channel.errorCode == 0)
            _channel = _ports.createRemotePort(channel.remotePortName.value_or(""));
        return channel.errorCode;
    }

    Value technology()
    {
        const auto query = propertyListXML(Dictionary::make({{"GetTechnology", "GetTechnology"}}));
        const auto result = _channel->request(0, *query, std::chrono::seconds(1), std::chrono::seconds(5));
        const auto reply = propertyListFromData(result.reply.value_or(Bytes())).value.value_or(Value());
        return reply.dictionary() ? (*reply.dictionary())["GetTechnology"] : Value();
    }

    // Without lists of codes everything is asked for.
    void send(const DictionaryRef& command = Dictionary::make({{"SetState", "Streaming"}}))
    {
        _channel->send(0, *propertyListXML(command), std::chrono::seconds(1));
    }

    std::vector<Bytes> messages;

private:
    SocketMessagePorts _ports;
    std::string _portName;
    std::shared_ptr<LocalPort> _port;
    std::shared_ptr<RemotePort> _channel;
};

} // namespace orvex::test
