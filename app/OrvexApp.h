#pragma once

#include "AppPlatform.h"
#include "OrvexPaneController.h"
#include "PaneWindow.h"
#include "SilenceWatch.h"

#include "Exposure.h"
#include "NavigationStack.h"
#include "Window.h"

#include <memory>
#include <optional>
#include <string>

namespace orvex {

class OrvexPaneController;

// The application with its window: a session, a stack of list screens, the status line of each.
class OrvexApp final : public std::enable_shared_from_this<OrvexApp>,
                       public OrvexModelListener,
                       public NavigationStack::Delegate,
                       public PaneHost {
public:
    // Without a size the window fills the main screen.
    static std::shared_ptr<OrvexApp> create(
        const AppPlatform& platform, const std::optional<QSize>& windowSize = std::nullopt);
    ~OrvexApp() override;
    OrvexApp(const OrvexApp&) = delete;
    OrvexApp& operator=(const OrvexApp&) = delete;

    // Opens the window and queues the start of the session.
    void applicationDidFinishLaunching();
    // Writes the home-screen preference, closes window and session. Further calls do nothing.
    void applicationWillTerminate();

    void updateViewControllerFromModel() override;
    void updateStatusForViewController(OrvexPaneController& screen);
    void willShowScreen(NavigationStack& stack, Screen& screen, bool animated) override;

    // Whether this is an internal build, read from its marker by getSaveButtonPref().
    bool allowSaveButton() const { return _allowSaveButton; }
    void getSaveButtonPref();
    bool offersSaveButton() const override { return _allowSaveButton; }
    // Opens the snapshot screen unless it is open.
    void showSaveView() override;
    void closeSaveView();
    // Null unless it is shown.
    Screen* saveViewController() const;

    void setGSMRSSI(bool shown);

    const std::optional<std::string>& updateMessage() const { return _updateMessage; }
    // All three null before launch and after termination.
    Window* window() const { return _window ? &_window->window() : nullptr; }
    NavigationStack* navigationStack() const { return _window ? &_window->stack() : nullptr; }
    OrvexModel* model() const { return _model.get(); }

private:
    OrvexApp(const AppPlatform& platform, const std::optional<QSize>& windowSize);

    // Gives the screens the tree and the status, or leaves that for the time when somebody can see them.
    void updateScreens();

    AppPlatform _platform;
    std::optional<QSize> _windowSize;
    std::unique_ptr<PaneWindow> _window;
    Exposure* _exposure = nullptr; // the window's
    std::unique_ptr<SilenceWatch> _silence;
    std::shared_ptr<OrvexModel> _model;
    std::optional<std::string> _updateMessage;
    bool _allowSaveButton = false;
    bool _hasTerminated = false;
};

} // namespace orvex
