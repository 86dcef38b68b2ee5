#include "Window.h"

#include "Indicators.h"
#include "Screen.h"
#include "TableCell.h"
#include "TableList.h"

#include <QAccessible>
#include <QAccessibleWidget>
#include <QApplication>
#include <QEvent>
#include <QScreen>

#include <utility>

namespace orvex {

namespace {

constexpr int kModalSlideMilliseconds = 300;

QAccessibleInterface* interfaceFor(const QString&, QObject* object)
{
    // Qt takes over what is returned.
    if (auto* const list = dynamic_cast<TableList*>(object))
        return new QAccessibleWidget(list, QAccessible::List);
    if (auto* const cell = dynamic_cast<TableCell*>(object))
        return new QAccessibleWidget(cell, QAccessible::ListItem);
    if (auto* const indicator = dynamic_cast<ActivityIndicator*>(object))
        return new QAccessibleWidget(indicator, QAccessible::Indicator);
    if (auto* const area = dynamic_cast<TouchArea*>(object))
        return new QAccessibleWidget(area, QAccessible::Pane);
    return nullptr;
}

} // namespace

Window::Window(const QString& title, const std::optional<QSize>& size)
{
    setWindowTitle(title);
    if (size)
        resize(*size);
    else
        setGeometry(QApplication::primaryScreen()->geometry());
}

void Window::setRootView(std::unique_ptr<QWidget> view)
{
    delete _root;
    _root = view.release();
    _root->setParent(this);
    _root->setGeometry(rect());
    _root->show();
    _root->setFocus();
}

void Window::presentModally(std::unique_ptr<Screen> screen, bool animated)
{
    _slide.finish();
    if (_modal)
        return;
    _modal = screen.release();
    _modal->setParent(this);
    _modal->resize(size());
    _modal->viewWillAppear(animated);
    _modal->show();
    _modal->raise();
    _modal->firstResponder().setFocus();
    _slide.start(
        kModalSlideMilliseconds,
        [this](double progress) { _modal->move(0, qRound((1 - progress) * height())); },
        // Hidden, the root view is out of reach of the Tab key.
        [this] { _root->hide(); });
    if (!animated)
        _slide.finish();
}

void Window::dismissModal(bool animated)
{
    _slide.finish();
    if (!_modal)
        return;
    Screen* const leaving = _modal;
    _modal = nullptr;
    leaving->viewWillDisappear(animated);
    _root->show();
    _root->setFocus();
    _root->lower(); // below an alert
    _slide.start(
        kModalSlideMilliseconds,
        [this, leaving](double progress) { leaving->move(0, qRound(progress * height())); },
        [leaving] {
            leaving->hide();
            leaving->deleteLater();
        });
    if (!animated)
        _slide.finish();
}

void Window::resizeEvent(QResizeEvent*)
{
    _slide.finish();
    if (_root)
        _root->setGeometry(rect());
    if (_modal)
        _modal->setGeometry(rect());
}

void installAccessibility()
{
    QAccessible::installFactory(interfaceFor);
}

FirstPaint::FirstPaint(std::function<void()> onPainted)
    : _onPainted(std::move(onPainted))
{
    // On all widgets: a window covered by its children gets no paint event.
    qApp->installEventFilter(this);
}

bool FirstPaint::eventFilter(QObject*, QEvent* event)
{
    // All widgets paint in one turn of the event loop, and the frame is on the screen after it.
    if (event->type() == QEvent::Paint && _onPainted)
        QMetaObject::invokeMethod(this, std::exchange(_onPainted, {}), Qt::QueuedConnection);
    return false;
}

} // namespace orvex
