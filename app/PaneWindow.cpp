#include "PaneWindow.h"

#include "FileDrop.h"
#include "FindScreen.h"

#include "EdgeSwipe.h"
#include "NavigationStack.h"
#include "Notice.h"
#include "Window.h"

#include <QCoreApplication>
#include <QShortcut>

namespace orvex {

PaneWindow::PaneWindow(const QString& title, const std::optional<QSize>& size, PaneHost& host,
    std::unique_ptr<OrvexPaneController> root)
    : _window(std::make_unique<Window>(title, size))
{
    auto stack = std::make_unique<NavigationStack>(std::move(root));
    _stack = stack.get();
    new EdgeSwipe(*_stack); // the stack's
    _window->setRootView(std::move(stack));
    addShortcuts(host);
    new FileDrop(*_window, [this](const std::string& path) { // the window's
        if (!openInAnotherProcess(path, *_window))
            Notice::show(*_window, QStringLiteral("The file cannot be opened."));
    });
}

PaneWindow::~PaneWindow() = default;

void PaneWindow::addShortcuts(PaneHost& host)
{
    const auto add = [](QWidget& place, const QKeySequence& keys, Qt::ShortcutContext context, auto action) {
        QObject::connect(
            new QShortcut(keys, &place, nullptr, nullptr, context), &QShortcut::activated, &place, action);
    };
    add(*_window, Qt::CTRL | Qt::Key_Q, Qt::WindowShortcut, [] { QCoreApplication::quit(); });
    // Only while no modal screen covers the stack.
    constexpr auto kOnStack = Qt::WidgetWithChildrenShortcut;
    add(*_stack, Qt::CTRL | Qt::Key_F, kOnStack, [this] { showFind(); });
    add(*_stack, Qt::ALT | Qt::Key_Left, kOnStack, [this] { _stack->pop(true); });
    add(*_stack, Qt::CTRL | Qt::Key_S, kOnStack, [&host] {
        if (host.offersSaveButton())
            host.showSaveView();
    });
}

void PaneWindow::showFind()
{
    const auto& root = static_cast<const OrvexPaneController&>(_stack->screenAt(0));
    // Later: the screen must not be deleted inside the action of its own widgets.
    const auto later = [this](auto action) {
        QMetaObject::invokeMethod(_stack, std::move(action), Qt::QueuedConnection);
    };
    _window->presentModally(std::make_unique<FindScreen>(root.node(),
                                FindScreen::Actions{
                                    .choose =
                                        [this, later](const FoundRow& row) {
                                            later([this, row] {
                                                closeFind();
                                                goTo(row);
                                            });
                                        },
                                    .cancel = [this, later] { later([this] { closeFind(); }); },
                                }),
        true);
}

void PaneWindow::closeFind()
{
    if (dynamic_cast<FindScreen*>(_window->modalScreen()))
        _window->dismissModal(true);
}

void PaneWindow::goTo(const FoundRow& row)
{
    _stack->popTo(0, false);
    for (const std::string& name : row.names) {
        if (!static_cast<OrvexPaneController&>(_stack->topScreen()).goToRow(name))
            return;
    }
}

} // namespace orvex
