#include "SnapshotViewer.h"

#include "OrvexPaneController.h"
#include "PaneWindow.h"
#include "SnapshotTree.h"

#include "NavigationStack.h"
#include "VisibleText.h"
#include "Window.h"

#include <QMessageBox>

namespace orvex {

namespace {
QString titleFor(const std::string& fileName)
{
    return QStringLiteral("%1 – Orvex").arg(QString::fromStdString(visibleText(fileName)));
}
} // namespace

SnapshotViewer::SnapshotViewer(
    const Snapshot& snapshot, const std::string& name, const std::optional<QSize>& windowSize)
    : SnapshotViewer(snapshotTree(snapshot), snapshotMessage(snapshot), name, windowSize)
{
}

SnapshotViewer::SnapshotViewer(OrvexModelNodeRef tree, const std::string& status, const std::string& name,
    const std::optional<QSize>& windowSize)
{
    auto root = std::make_unique<OrvexPaneController>(*this, std::move(tree), "/");
    root->setStatus(status, false); // the screens above take it over
    _window = std::make_unique<PaneWindow>(titleFor(name), windowSize, *this, std::move(root));
    _window->window().show();
}

const Window& SnapshotViewer::window() const
{
    return _window->window();
}

NavigationStack& SnapshotViewer::navigationStack() const
{
    return _window->stack();
}

SnapshotViewer::~SnapshotViewer() = default;

void alertOfFileError(const std::string& name, const std::string& error)
{
    QMessageBox alert(QMessageBox::Critical, titleFor(name), QString::fromStdString(visibleText(error)));
    alert.setTextFormat(Qt::PlainText); // a file's name is no markup
    alert.exec();
}

std::string snapshotMessage(const Snapshot& snapshot)
{
    return "Saved " + visibleText(snapshot.timestamp);
}

} // namespace orvex
