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

// Told on the run loop that the display tree has to be read again.
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
        // Told at each start of a session that can show nothing, in one line: which template, and why.
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

    // Messages that a generator has decoded, over all sessions.
    std::uint64_t decodedMessages() const { return _decodedMessages; }

    // The root of the display tree, built on demand. Null while no technology is known.
    OrvexModelNodeRef topLevelNodes();
    // Null when no node has the path.
    OrvexModelNodeRef nodeAtPath(const std::string& path);
    // What a snapshot stores. Null while no technology is known.
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
