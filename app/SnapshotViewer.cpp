#include "SnapshotViewer.h"

#include "OrvexPaneController.h"
#include "SnapshotTree.h"

#include "NavigationStack.h"
#include "VisibleText.h"
#include "Window.h"

namespace orvex {

SnapshotViewer::SnapshotViewer(
    const Snapshot& snapshot, const std::string& name, const std::optional<QSize>& windowSize)
    : _window(std::make_unique<Window>(
        QStringLiteral("%1 – Orvex").arg(QString::fromStdString(visibleText(name))), windowSize))
{
    auto root = std::make_unique<OrvexPaneController>(*this, snapshotTree(snapshot), "/");
    root->setStatus(snapshotMessage(snapshot), false); // the screens above take it over
    auto stack = std::make_unique<NavigationStack>(std::move(root));
    _navController = stack.get();
    _window->setRootView(std::move(stack));
    _window->show();
}

SnapshotViewer::~SnapshotViewer() = default;

std::string snapshotMessage(const Snapshot& snapshot)
{
    return "Saved " + visibleText(snapshot.timestamp);
}

} // namespace orvex
