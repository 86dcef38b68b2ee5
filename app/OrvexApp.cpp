#include "OrvexApp.h"

#include "AppPlatform.h"
#include "OrvexPaneController.h"
#include "OrvexSaveViewController.h"

#include "Notice.h"
#include "Storage.h"
#include "VisibleText.h"

#include <filesystem>

namespace orvex {

namespace {
// A handset has it; elsewhere it is created. If that fails, the save fails too and reports it.
std::string reportDirectory()
{
    namespace fs = std::filesystem;
    std::string directory = paths::diagnosticReports();
    std::error_code ignored;
    fs::create_directories(fs::path(directory).parent_path(), ignored);
    if (fs::create_directory(directory, ignored))
        fs::permissions(directory, fs::perms::owner_all, ignored);
    return directory;
}
} // namespace

std::shared_ptr<OrvexApp> OrvexApp::create(
    const AppPlatform& platform, const std::optional<QSize>& windowSize)
{
    return std::shared_ptr<OrvexApp>(new OrvexApp(platform, windowSize));
}

OrvexApp::OrvexApp(const AppPlatform& platform, const std::optional<QSize>& windowSize)
    : _platform(platform)
    , _windowSize(windowSize)
{
}

OrvexApp::~OrvexApp()
{
    // A retry queued on the run loop may keep the model alive.
    if (_model)
        _model->setListener(nullptr);
}

void OrvexApp::applicationDidFinishLaunching()
{
    getSaveButtonPref();
    _model = OrvexModel::create(_platform.session);
    _model->setListener(this);
    _updateMessage = kConnectingMessage;

    auto root = std::make_unique<OrvexPaneController>(*this, nullptr, "/");
    // Without the dots, which come with the first status of the session.
    root->setStatus("Connecting", true);
    _window = std::make_unique<PaneWindow>(QStringLiteral("Orvex"), _windowSize, *this, std::move(root));
    _window->stack().setDelegate(this);
    _exposure = new Exposure(_window->window(), [this] { updateScreens(); });
    _silence = std::make_unique<SilenceWatch>(
        _platform.session.runLoop, [this](bool isSilent) { _window->stack().setDimmed(isSilent); });
    _window->window().show();

    _platform.session.runLoop.post([self = shared_from_this()] {
        if (self->_model)
            self->_model->restartMonitor();
    });
}

void OrvexApp::applicationWillTerminate()
{
    if (std::exchange(_hasTerminated, true))
        return;
    setGSMRSSI(false);
    _updateMessage.reset();
    _silence.reset();
    _window.reset();
    if (_model)
        _model->setListener(nullptr);
    _model.reset();
}

void OrvexApp::updateViewControllerFromModel()
{
    if (!_model || !_window)
        return;
    if (_model->isConnected())
        _updateMessage = updateMessageAt(_platform.session.generators.clock.now());
    _silence->heard();
    if (_exposure->isSeen())
        updateScreens();
    else
        _model->topLevelNodes(); // asked for all the same: each answer is an entry of the history
}

void OrvexApp::updateScreens()
{
    if (!_model || !_window)
        return;
    reloadPanes(_window->stack(), _model->topLevelNodes(),
        [this](const std::string& path) { return _model->nodeAtPath(path); });
    updateStatusForViewController(static_cast<OrvexPaneController&>(_window->stack().topScreen()));
}

void OrvexApp::updateStatusForViewController(OrvexPaneController& screen)
{
    if (_model && _model->isConnected())
        screen.setStatus(_updateMessage, false);
    else
        screen.setStatus(kConnectingMessage, true);
}

void OrvexApp::willShowScreen(NavigationStack&, Screen& screen, bool)
{
    updateStatusForViewController(static_cast<OrvexPaneController&>(screen));
}

void OrvexApp::getSaveButtonPref()
{
    std::error_code ignored;
    _allowSaveButton = std::filesystem::exists(paths::internalBuildMarker(), ignored);
}

Screen* OrvexApp::saveViewController() const
{
    return _window ? dynamic_cast<OrvexSaveViewController*>(_window->window().modalScreen()) : nullptr;
}

void OrvexApp::showSaveView()
{
    if (!_window || _window->window().modalScreen())
        return;
    // Later: the screen must not be deleted inside the action of its own button.
    auto close = [&runLoop = _platform.session.runLoop, app = weak_from_this()] {
        runLoop.post([app] {
            if (const auto self = app.lock())
                self->closeSaveView();
        });
    };
    auto screen = std::make_unique<OrvexSaveViewController>(
        _model->getSaveContents(), _platform.session.generators.clock, reportDirectory(), std::move(close));
    screen->setSavedHandler([this](const std::string& path) {
        Notice::show(_window->window(), QStringLiteral("Saved ") + QString::fromStdString(visibleText(path)));
    });
    _window->window().presentModally(std::move(screen), true);
}

void OrvexApp::closeSaveView()
{
    if (saveViewController())
        _window->window().dismissModal(true);
}

void OrvexApp::setGSMRSSI(bool shown)
{
    setGSMRSSIPreference(_platform.preferences, shown);
}

} // namespace orvex
