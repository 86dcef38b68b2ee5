#pragma once

#include "KoratTelephonyService.h"
#include "PropertyList.h"
#include "SocketMessagePorts.h"
#include "TelephonyConstants.h"

#include "Dictionary.h"

#include <gtest/gtest.h>

#include <map>

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
        _port = _ports
                    .createLocalPort(_portName,
                        [this](std::int32_t messageId, ByteView data) -> std::optional<Bytes> {
                            if (messageId == 0)
                                messages.emplace_back(data.begin(), data.end());
                            return std::nullopt;
                        })
                    .port;
        KoratTelephonyService service(_ports);
        const auto connection = service.connect([] {});
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
        const auto reply = result.reply ? propertyListFromData(*result.reply).value : std::nullopt;
        return reply && reply->dictionary() ? (*reply->dictionary())["GetTechnology"] : Value();
    }

    // Without lists of codes everything is asked for.
    void send(const DictionaryRef& command = Dictionary::make({{"SetState", "Streaming"}}))
    {
        EXPECT_EQ(_channel->send(0, *propertyListXML(command), std::chrono::seconds(1)),
            RemotePort::Status::success);
    }

    // How many messages of each type and code there were: 0xB179, 0xFF0001...
    std::map<unsigned, std::size_t> codes() const
    {
        std::map<unsigned, std::size_t> result;
        for (const Bytes& message : messages)
            ++result[(message.at(0) == 255 ? 0xFF0000U : 0U) | message.at(3) | message.at(4) * 256U];
        return result;
    }

    std::vector<Bytes> messages;

private:
    SocketMessagePorts _ports;
    std::string _portName;
    std::shared_ptr<LocalPort> _port;
    std::shared_ptr<RemotePort> _channel;
};

} // namespace orvex::test
