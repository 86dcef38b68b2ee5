#pragma once

#include "OrvexPaneController.h"
#include "Snapshot.h"

#include <QSize>

#include <memory>
#include <optional>
#include <string>

namespace orvex {

class NavigationStack;
class Window;

// Shows a saved snapshot on the list screens, without a session.
class SnapshotViewer final : public PaneHost {
public:
    // The name goes into the window's title. Without a size the window fills the main screen.
    SnapshotViewer(const Snapshot& snapshot, const std::string& name,
        const std::optional<QSize>& windowSize = std::nullopt);
    ~SnapshotViewer() override;
    SnapshotViewer(const SnapshotViewer&) = delete;
    SnapshotViewer& operator=(const SnapshotViewer&) = delete;

    const Window& window() const { return *_window; }
    NavigationStack& navigationStack() const { return *_navController; }

    bool offersSaveButton() const override { return false; }
    void showSaveView() override { }

private:
    std::unique_ptr<Window> _window;
    NavigationStack* _navController; // the window's
};

// The status line of a snapshot.
std::string snapshotMessage(const Snapshot& snapshot);

} // namespace orvex
