#pragma once

#include "MessagePort.h"
#include "PropertyList.h"
#include "TelephonyConstants.h"
#include "TelephonyService.h"

#include "Dictionary.h"

namespace orvex::test {

// A port that is valid until it is invalidated.
template <typename Interface>
class FakePort : public Interface {
public:
    bool isValid() const override { return valid; }
    void invalidate() override
    {
        if (!std::exchange(valid, false))
            return;
        if (const auto callback = std::exchange(_callback, {}))
            callback();
    }
    void setInvalidationCallback(std::function<void()> callback) override { _callback = std::move(callback); }

    bool valid = true;

private:
    std::function<void()> _callback;
};

// Faults of the telephony service; by default it has none.
struct TelephonyFaults {
    bool localPortFails = false;
    bool localPortExists = false;
    bool serviceIsAbsent = false;
    long channelError = 0;
    std::optional<std::string> remotePortName = "org.orvex.Korat.Test";
    bool remotePortFails = false;
    RemotePort::Status requestStatus = RemotePort::Status::success;
    RemotePort::Status commandStatus = RemotePort::Status::success;
    std::optional<std::string> rawReply = {}; // in place of the well-formed one; empty for no reply at all
    Value technology = telephony::kTechnologyMRL_LTE;
};

// The telephony service and its message ports in one. It answers with `technology` and takes every command.
class FakeTelephony final : public MessagePorts, public TelephonyService, public TelephonyFaults {
public:
    // What was seen.
    int localPortsCreated = 0;
    std::vector<Value> sent; // the query, then the command
    std::shared_ptr<FakePort<LocalPort>> localPort;
    std::shared_ptr<FakePort<RemotePort>> remotePort;

    std::vector<std::string> portNames; // of local ports, as asked for, and of channels
    std::vector<std::int32_t> messageIds;
    std::vector<std::chrono::milliseconds> timeouts;
    std::function<void()> notifyConnection;
    bool isConnected = false; // a connection exists
    bool wasConnectedAtRemotePort = false;

    // Delivers a message to the local port and returns its reply.
    std::optional<Bytes> deliver(const Bytes& message, std::int32_t messageId = 0)
    {
        return _receiver(messageId, message);
    }

    LocalPortResult createLocalPort(const std::string& name, Receiver receiver) override
    {
        portNames.push_back(name);
        ++localPortsCreated;
        if (localPortFails)
            return {};
        _receiver = std::move(receiver);
        localPort = std::make_shared<FakePort<LocalPort>>();
        return {localPort, localPortExists};
    }

    std::shared_ptr<RemotePort> createRemotePort(const std::string&) override
    {
        wasConnectedAtRemotePort = isConnected;
        if (remotePortFails)
            return nullptr;
        remotePort = std::make_shared<FakeRemotePort>(*this);
        return remotePort;
    }

    std::unique_ptr<TelephonyConnection> connect(std::function<void()> onNotification) override
    {
        notifyConnection = std::move(onNotification);
        return serviceIsAbsent ? nullptr : std::make_unique<FakeConnection>(*this);
    }

private:
    struct FakeConnection final : TelephonyConnection {
        explicit FakeConnection(FakeTelephony& owner)
            : _owner(owner)
        {
            _owner.isConnected = true;
        }
        ~FakeConnection() override { _owner.isConnected = false; }
        LogChannelReply createNetworkMonitorLogChannel(const std::string& name) override
        {
            _owner.portNames.push_back(name);
            return {0, _owner.channelError, _owner.remotePortName};
        }
        FakeTelephony& _owner;
    };

    struct FakeRemotePort final : FakePort<RemotePort> {
        explicit FakeRemotePort(FakeTelephony& owner)
            : _owner(owner)
        {
        }
        Status send(std::int32_t messageId, ByteView data, std::chrono::milliseconds timeout) override
        {
            _owner.messageIds.push_back(messageId);
            _owner.timeouts.push_back(timeout);
            _owner.sent.push_back(propertyListFromData(data).value.value_or(Value()));
            return _owner.commandStatus;
        }
        SendResult request(std::int32_t messageId, ByteView data, std::chrono::milliseconds sendTimeout,
            std::chrono::milliseconds receiveTimeout) override
        {
            _owner.messageIds.push_back(messageId);
            _owner.timeouts.insert(_owner.timeouts.end(), {sendTimeout, receiveTimeout});
            _owner.sent.push_back(propertyListFromData(data).value.value_or(Value()));
            if (_owner.requestStatus != Status::success)
                return {_owner.requestStatus, std::nullopt};
            if (_owner.rawReply == "")
                return {Status::success, std::nullopt};
            if (_owner.rawReply)
                return {Status::success, Bytes(_owner.rawReply->begin(), _owner.rawReply->end())};
            return {
                Status::success, propertyListXML(Dictionary::make({{"GetTechnology", _owner.technology}}))};
        }
        std::size_t pendingBytes() const override { return 0; }
        FakeTelephony& _owner;
    };

    Receiver _receiver;
};

} // namespace orvex::test
