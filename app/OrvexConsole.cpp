#include "OrvexConsole.h"

#include "HomeScreenPreference.h"
#include "TerminalFrame.h"
#include "UpdateMessage.h"

#include "DisplayTreePrinter.h"

#include <utility>

namespace orvex {

namespace {
using namespace std::chrono_literals;

constexpr auto kConnectionCheckPeriod = 1s;
constexpr const char* kClearScreen = "\x1b[2J";
constexpr const char* kCursorHome = "\x1b[H";
constexpr const char* kClearLineEnd = "\x1b[K";
constexpr const char* kClearBelow = "\x1b[J";
} // namespace

OrvexConsole::OrvexConsole(const AppPlatform& platform, ConsoleOutput& output)
    : _platform(platform)
    , _output(output)
{
}

OrvexConsole::~OrvexConsole()
{
    // A retry that waits on the run loop may hold the model for longer.
    if (_model)
        _model->setListener(nullptr);
}

void OrvexConsole::start()
{
    _model = OrvexModel::create(_platform.session);
    _model->setListener(this);
    sayConnecting();
    _platform.session.runLoop.post([weakModel = std::weak_ptr(_model)] {
        if (const auto model = weakModel.lock())
            model->restartMonitor();
    });
    _connectionTimer =
        _platform.session.runLoop.startTimer(kConnectionCheckPeriod, [this] { checkConnection(); });
}

void OrvexConsole::applicationWillTerminate()
{
    const auto model = std::exchange(_model, nullptr);
    if (!model)
        return;
    _connectionTimer.reset();
    setGSMRSSIPreference(_platform.preferences, false);
    model->setListener(nullptr);
}

void OrvexConsole::updateViewControllerFromModel()
{
    if (!_model)
        return;
    const OrvexModelNodeRef root = _model->topLevelNodes();
    _tree = root ? DisplayTreePrinter::lines(*root) : std::vector<std::string>();
    if (!_model->isConnected())
        return checkConnection();
    _saidConnecting = false;
    write(updateMessageAt(_platform.session.generators.clock.now()));
}

// The session tells of new data, not of a connection that is lost.
void OrvexConsole::checkConnection()
{
    if (_model && !_model->isConnected() && !_saidConnecting)
        sayConnecting();
}

void OrvexConsole::sayConnecting()
{
    _saidConnecting = true;
    write(kConnectingMessage);
}

void OrvexConsole::write(const std::string& status)
{
    std::string text;
    if (const auto terminal = _output.terminalSize()) {
        // What stood there is overwritten rather than cleared first, which would flicker.
        text += _wroteBefore ? kCursorHome : std::string(kCursorHome) + kClearScreen;
        for (const std::string& line : terminalFrame(status, _tree, *terminal))
            text += line + kClearLineEnd + '\n';
        text += kClearBelow;
    } else {
        if (_wroteBefore)
            text += '\n';
        text += status + '\n';
        if (!_saidConnecting) {
            for (const std::string& line : _tree)
                text += line + '\n';
        }
    }
    _wroteBefore = true;
    _output.write(text);
}

} // namespace orvex
