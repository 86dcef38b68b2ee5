#pragma once

#include "OrvexPaneController.h"
#include "TreeSearch.h"

#include <QObject>
#include <QSize>
#include <QString>

#include <memory>
#include <optional>

namespace orvex {

class NavigationStack;
class Window;

// A window with a stack of list screens, and what they all share: keyboard shortcuts, search, swiping back,
// dropping files.
class PaneWindow {
public:
    // Without a size the window fills the main screen. The host must outlive the window. Hidden at first.
    PaneWindow(const QString& title, const std::optional<QSize>& size, PaneHost& host,
        std::unique_ptr<OrvexPaneController> root);
    ~PaneWindow();
    PaneWindow(const PaneWindow&) = delete;
    PaneWindow& operator=(const PaneWindow&) = delete;

    Window& window() const { return *_window; }
    NavigationStack& stack() const { return *_stack; }

    // Opens the search unless a modal screen is open.
    void showFind();
    // Goes to the row, or as far as the tree still has its path: opens a branch, selects a leaf.
    void goTo(const FoundRow& row);

private:
    void addShortcuts(PaneHost& host);
    void closeFind();

    std::unique_ptr<Window> _window;
    NavigationStack* _stack; // the window's
};

} // namespace orvex
