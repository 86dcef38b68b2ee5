#include "OrvexConsole.h"

#include "Snapshot.h"
#include "VisibleText.h"

#include <utility>

namespace orvex {

namespace {
using namespace std::chrono_literals;

constexpr auto kConnectionCheckPeriod = 1s;
} // namespace

OrvexConsole::OrvexConsole(const AppPlatform& platform, ConsoleView& view, ConsoleOptions options)
    : _platform(platform)
    , _view(view)
    , _options(std::move(options))
{
}

OrvexConsole::~OrvexConsole()
{
    // A retry queued on the run loop may keep the model alive.
    if (_model)
        _model->setListener(nullptr);
}

void OrvexConsole::start(std::function<void()> onEnd)
{
    _onEnd = std::move(onEnd);
    if (!startRecording())
        return;
    _model = OrvexModel::create(_platform.session);
    _model->setListener(this);
    sayConnecting();
    RunLoop& runLoop = _platform.session.runLoop;
    runLoop.post([weakModel = std::weak_ptr(_model)] {
        if (const auto model = weakModel.lock())
            model->restartMonitor();
    });
    _connectionTimer = runLoop.startTimer(kConnectionCheckPeriod, [this] { checkConnection(); });
    if (_options.timeout)
        _timeout = runLoop.startTimer(*_options.timeout, [this] { timeIsUp(); });
}

void OrvexConsole::applicationWillTerminate()
{
    if (!_model)
        return;
    record();
    _recordingTimer.reset();
    if (_options.saveFile)
        save();
    const auto model = std::exchange(_model, nullptr);
    _connectionTimer.reset();
    _timeout.reset();
    setGSMRSSIPreference(_platform.preferences, false);
    model->setListener(nullptr);
}

void OrvexConsole::updateViewControllerFromModel()
{
    if (!_model)
        return;
    const bool isWhole = _options.path == "/";
    _tree = isWhole ? _model->topLevelNodes() : _model->nodeAtPath(_options.path);
    if (!_model->isConnected())
        return checkConnection();
    _saidConnecting = false;
    _cameUp = true;
    if (_options.once && !_tree)
        return; // it may come
    show(updateMessageAt(_platform.session.generators.clock.now()), _tree);
    if (_options.once)
        end();
}

// The session reports new data, but not a lost connection.
void OrvexConsole::checkConnection()
{
    if (!_model)
        return;
    if (_model->isConnected())
        _cameUp = true;
    else if (!_saidConnecting)
        sayConnecting();
}

void OrvexConsole::sayConnecting()
{
    _saidConnecting = true;
    if (!_options.once)
        show(kConnectingMessage, _tree);
}

void OrvexConsole::show(const std::string& status, const OrvexModelNodeRef& tree)
{
    _view.show({.status = status,
        .isConnected = !_saidConnecting,
        .path = _options.path,
        .tree = tree,
        .messages = _model->decodedMessages()});
}

// Returns false when there is to be a recording and its file cannot be created.
bool OrvexConsole::startRecording()
{
    if (!_options.timelineFile)
        return true;
    _recording.emplace(*_options.timelineFile, _options.sampling);
    _failure = _recording->failure();
    RunLoop& runLoop = _platform.session.runLoop;
    if (!_failure.empty()) {
        runLoop.post([this] { end(); });
        return false;
    }
    _recordingTimer = runLoop.startTimer(_options.sampling.every, [this] { record(); });
    return true;
}

void OrvexConsole::record()
{
    if (!_recording || !_model || !_failure.empty() || _model->decodedMessages() == _recordedMessages)
        return;
    _recordedMessages = _model->decodedMessages();
    _recording->sample(_platform.session.generators.clock.now(), _model->shownDisplay());
    _failure = _recording->failure();
    if (!_failure.empty())
        end();
}

void OrvexConsole::timeIsUp()
{
    checkConnection();
    if (!_cameUp)
        _failure = "no session came up in time. 'orvex --diagnose' says why.";
    else if (_options.once)
        _failure = _model->decodedMessages() == 0
            ? "the session came up, but no message came in time."
            : "nothing appeared at " + visibleText(_options.path) + " in time.";
    end();
}

void OrvexConsole::save()
{
    const Date now = _platform.session.generators.clock.now();
    const ArrayRef contents = _model->getSaveContents();
    const std::string error = contents ? writeSnapshot({dateText(now), contents, ""}, *_options.saveFile)
                                       : "no snapshot was saved, as no session came up.";
    if (_failure.empty())
        _failure = error;
}

void OrvexConsole::end()
{
    _timeout.reset();
    if (const auto onEnd = std::exchange(_onEnd, nullptr))
        onEnd();
}

} // namespace orvex
