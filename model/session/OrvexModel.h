#pragma once

#include "LogGenerator.h"
#include "NodesByPath.h"

#include "MessagePort.h"
#include "RunLoop.h"
#include "TelephonyService.h"

#include <cstdint>
#include <functional>
#include <memory>

namespace orvex {

// Notified on the run loop when the display tree must be read again.
class OrvexModelListener {
public:
    virtual ~OrvexModelListener() = default;
    virtual void updateViewControllerFromModel() = 0;
};

// The monitor session: opens the log channel, asks for the log technology, starts the stream, feeds the
// generator with what arrives and, every two seconds in which something arrived, drops the display tree so
// that the next reader rebuilds it. A start that fails is tried again after five seconds, without limit; a
// channel that breaks is reopened at once. Failures go to the system log.
//
// Everything runs on the run loop's thread. A retry that waits on the run loop holds the model.
class OrvexModel : public std::enable_shared_from_this<OrvexModel> {
public:
    struct Platform {
        RunLoop& runLoop;
        MessagePorts& ports;
        TelephonyService& telephony;
        GeneratorEnvironment generators;
        // Called at each start of a session that can show nothing, with one line: which template, and why.
        std::function<void(const std::string& why)> printError = {};
    };

    static std::shared_ptr<OrvexModel> create(const Platform& platform);
    ~OrvexModel();
    OrvexModel(const OrvexModel&) = delete;
    OrvexModel& operator=(const OrvexModel&) = delete;

    // The listener is held weakly by address: clear it before it goes.
    void setListener(OrvexModelListener* listener) { _listener = listener; }

    // True while both ports exist.
    bool isConnected() const { return _recvPort && _sendPort; }

    void startMonitor();
    void restartMonitor();
    // Tests the ports' health and, when a message arrived since the last call, drops the tree and tells the
    // listener.
    void refresh();
    // Takes one log message.
    void updateWithData(ByteView data);

    // Messages decoded so far, over all sessions.
    std::uint64_t decodedMessages() const { return _decodedMessages; }

    // The root of the display tree, built on demand. Null while the technology is unknown.
    OrvexModelNodeRef topLevelNodes();
    // Null when no node has the path.
    OrvexModelNodeRef nodeAtPath(const std::string& path);
    // The display as it stands, without asking the generator for it, which would make a history entry. Null
    // before the first message.
    const Value& shownDisplay() const { return (*_state)["Display"]; }
    // What a snapshot stores. Null while the technology is unknown.
    ArrayRef getSaveContents() const;

private:
    explicit OrvexModel(const Platform& platform);

    bool createPorts();
    void destroyPorts();
    void configureGenerator();
    bool sendStartCommand();
    void retryLater();

    Platform _platform;
    OrvexModelListener* _listener = nullptr;

    std::shared_ptr<LocalPort> _recvPort;
    std::shared_ptr<RemotePort> _sendPort;
    std::unique_ptr<RunLoop::Timer> _displayUpdateTimer; // set while the monitor is running
    bool _updated = false;                               // something arrived since the last refresh
    std::uint64_t _decodedMessages = 0;

    std::unique_ptr<LogGenerator> _logGenerator;
    DictionaryRef _state; // the generator state; survives restarts

    OrvexModelNodeRef _nodes; // null means that the tree is to be rebuilt
    std::unique_ptr<NodesByPath> _nodesByPath;
};

} // namespace orvex
