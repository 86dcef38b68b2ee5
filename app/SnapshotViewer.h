#pragma once

#include "OrvexPaneController.h"
#include "Snapshot.h"

#include <QSize>

#include <memory>
#include <optional>
#include <string>

namespace orvex {

class NavigationStack;
class PaneWindow;
class Window;

// Shows a saved snapshot, or the tree of a capture, on the list screens, without a session.
class SnapshotViewer final : public PaneHost {
public:
    // The name goes into the window's title. Without a size the window fills the main screen.
    SnapshotViewer(const Snapshot& snapshot, const std::string& name,
        const std::optional<QSize>& windowSize = std::nullopt);
    // Shows any tree, with that status.
    SnapshotViewer(OrvexModelNodeRef tree, const std::string& status, const std::string& name,
        const std::optional<QSize>& windowSize);
    ~SnapshotViewer() override;
    SnapshotViewer(const SnapshotViewer&) = delete;
    SnapshotViewer& operator=(const SnapshotViewer&) = delete;

    const Window& window() const;
    NavigationStack& navigationStack() const;

    bool offersSaveButton() const override { return false; }
    void showSaveView() override { }

private:
    std::unique_ptr<PaneWindow> _window;
};

// Says in a window why the file of that name cannot be shown, and returns when the user has closed it.
void alertOfFileError(const std::string& name, const std::string& error);

// The status line of a snapshot.
std::string snapshotMessage(const Snapshot& snapshot);

} // namespace orvex
