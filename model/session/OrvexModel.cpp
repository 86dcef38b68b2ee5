#include "OrvexModel.h"

#include "PropertyList.h"
#include "SystemLog.h"
#include "TelephonyConstants.h"

#include "Array.h"

namespace orvex {

namespace {
using namespace std::chrono_literals;

constexpr auto kSendTimeout = 1s;
constexpr auto kReceiveTimeout = 1s;
constexpr auto kRefreshPeriod = 2s;
constexpr auto kRetryDelay = 5s;
} // namespace

std::shared_ptr<OrvexModel> OrvexModel::create(const Platform& platform)
{
    return std::shared_ptr<OrvexModel>(new OrvexModel(platform));
}

OrvexModel::OrvexModel(const Platform& platform)
    : _platform(platform)
    , _state(Dictionary::make())
{
}

OrvexModel::~OrvexModel()
{
    destroyPorts();
}

bool OrvexModel::createPorts()
{
    const std::string portName = telephony::kLogChannelPortName;
    // Ports and connections call back into a model that may be gone by then.
    const std::weak_ptr<OrvexModel> weakModel = weak_from_this();

    auto local = _platform.ports.createLocalPort(
        portName, [weakModel](std::int32_t messageId, ByteView data) -> std::optional<Bytes> {
            if (const auto model = weakModel.lock(); model && messageId == telephony::kLogChannelMessageId)
                model->updateWithData(data);
            return std::nullopt;
        });
    _recvPort = std::move(local.port);
    if (!_recvPort) {
        systemLog(Priority::error, "Could not create local message port");
        return false;
    }
    if (local.alreadyExisted) {
        systemLog(Priority::error, "Local messsage port already exists");
        return false;
    }
    _recvPort->setInvalidationCallback([weakModel, port = static_cast<const void*>(_recvPort.get())] {
        systemLog(Priority::error, " ***** INVALIDATED %p *****", port);
        if (const auto model = weakModel.lock())
            model->restartMonitor();
    });

    auto connection = _platform.telephony.connect([weakModel] {
        if (const auto model = weakModel.lock())
            model->refresh();
    });
    if (!connection) {
        systemLog(Priority::error, "Could not create KoratServerConnection");
        return false;
    }
    const auto channel = connection->createNetworkMonitorLogChannel(portName);
    connection.reset(); // no longer needed
    if (channel.errorCode != 0) {
        systemLog(Priority::error, "_KoratServerConnectionNetworkMonitorCreateLogChannel returns error: %ld!",
            channel.errorCode);
        return false;
    }
    if (channel.remotePortName.value_or("").empty()) {
        systemLog(Priority::error, "Could not create a log channel (Korat returned null port)!");
        return false;
    }
    _sendPort = _platform.ports.createRemotePort(*channel.remotePortName);
    if (!_sendPort) {
        systemLog(Priority::error, "Could not create the remote port!");
        return false;
    }
    systemLog(Priority::error, " ***** Created ports (send=%p, recv=%p)",
        static_cast<const void*>(_sendPort.get()), static_cast<const void*>(_recvPort.get()));
    return true;
}

void OrvexModel::destroyPorts()
{
    _displayUpdateTimer.reset();
    const auto close = [](auto& port) {
        if (!port)
            return;
        port->setInvalidationCallback({}); // a deliberate shutdown restarts nothing
        port->invalidate();
        port.reset();
    };
    close(_recvPort);
    close(_sendPort);
}

void OrvexModel::configureGenerator()
{
    const auto query =
        propertyListXML(Dictionary::make({{telephony::kGetTechnology, telephony::kGetTechnology}}));
    if (!query) {
        systemLog(Priority::error, " Could not generate GetTechnology command; cannot configure");
        return;
    }
    const auto sent =
        _sendPort->request(telephony::kLogChannelMessageId, *query, kSendTimeout, kReceiveTimeout);
    if (sent.status != RemotePort::Status::success) {
        systemLog(Priority::error, " ***** Could not send the GetTechnology command (got error=%d)",
            static_cast<int>(sent.status));
        return;
    }
    if (!sent.reply) {
        systemLog(Priority::error, " ***** No response to GetTechnology; cannot configure");
        return;
    }
    const auto reply = propertyListFromData(*sent.reply);
    if (!reply.value) {
        systemLog(Priority::error, " ***** Could not parse reply to GetTechnology; cannot configure");
        return;
    }
    const auto answers = reply.value->dictionary();
    if (!answers || !answers->contains(telephony::kGetTechnology)) {
        systemLog(Priority::error, " ***** Reply to GetTechnology had no answer; cannot configure");
        return;
    }
    _logGenerator =
        LogGenerator::generatorFromTechnology((*answers)[telephony::kGetTechnology], _platform.generators);
    systemLog(Priority::error, "Got log generated: %p", static_cast<const void*>(_logGenerator.get()));
}

void OrvexModel::startMonitor()
{
    if (_displayUpdateTimer)
        return;
    if (!createPorts()) {
        systemLog(Priority::error, "Could not create the ports necessary");
        return retryLater();
    }
    configureGenerator();
    if (!_logGenerator) {
        systemLog(Priority::error, "No log generator technology works");
        return retryLater();
    }
    if (!sendStartCommand())
        return retryLater();

    systemLog(Priority::error, "Starting the display update timer");
    // The timer is destroyed with the model, so its task holds no reference; but the task itself may
    // release the last other one.
    _displayUpdateTimer = _platform.runLoop.startTimer(kRefreshPeriod, [this] {
        const auto self = shared_from_this();
        refresh();
    });
    const std::string error = _logGenerator->templateError(*_state);
    if (!error.empty() && _platform.printError)
        _platform.printError(error);
}

bool OrvexModel::sendStartCommand()
{
    const auto command = propertyListXML(_logGenerator->getStartCommand());
    if (!command) {
        systemLog(Priority::error, " Could not generate PLIST");
        return false;
    }
    const auto status = _sendPort->send(telephony::kLogChannelMessageId, *command, kSendTimeout);
    if (status != RemotePort::Status::success) {
        systemLog(Priority::error, " ***** Could not send the START command (got error=%d)",
            static_cast<int>(status));
        return false;
    }
    return true;
}

void OrvexModel::retryLater()
{
    destroyPorts();
    _platform.runLoop.postAfter(kRetryDelay, [model = shared_from_this()] { model->startMonitor(); });
}

void OrvexModel::restartMonitor()
{
    destroyPorts();
    startMonitor();
}

void OrvexModel::refresh()
{
    if (_sendPort && _recvPort && !_sendPort->isValid()) {
        const auto port = _recvPort;
        // If the refresh is late, the last messages of a service that is gone are still unread.
        port->deliverWaiting();
        // Restarts the monitor, which releases the port.
        port->invalidate();
    }
    if (!_updated)
        return;
    _updated = false;
    _nodes.reset();
    _nodesByPath.reset();
    _platform.runLoop.post([weakModel = weak_from_this()] {
        const auto model = weakModel.lock();
        if (model && model->_listener)
            model->_listener->updateViewControllerFromModel();
    });
}

void OrvexModel::updateWithData(ByteView data)
{
    if (_logGenerator) {
        _logGenerator->updateState(*_state, data);
        ++_decodedMessages;
    }
    _updated = true;
}

OrvexModelNodeRef OrvexModel::topLevelNodes()
{
    if (_nodes || !_logGenerator)
        return _nodes;
    const Value display = _logGenerator->generateLogUsingState(*_state);
    auto nodesByPath = std::make_unique<NodesByPath>();
    _nodes = OrvexModelNode::makeTreeFromObject(display, *nodesByPath);
    _nodesByPath = std::move(nodesByPath);
    return _nodes;
}

OrvexModelNodeRef OrvexModel::nodeAtPath(const std::string& path)
{
    if (!_nodesByPath)
        topLevelNodes();
    if (!_nodesByPath)
        return nullptr;
    return (*_nodesByPath)[path];
}

ArrayRef OrvexModel::getSaveContents() const
{
    return _logGenerator ? _logGenerator->getSaveContentsFromState(*_state) : nullptr;
}

} // namespace orvex
