#include "Window.h"

#include <QGuiApplication>
#include <QScreen>

namespace orvex {

namespace {
constexpr int kSlideMilliseconds = 300;
} // namespace

Window::Window(const QString& title, const std::optional<QSize>& size)
{
    setWindowTitle(title);
    if (size)
        resize(*size);
    else
        setGeometry(QGuiApplication::primaryScreen()->geometry());
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
        kSlideMilliseconds, [this](double progress) { _modal->move(0, qRound((1 - progress) * height())); },
        // Out of sight the root view is out of the Tab key's reach too.
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
    _root->lower(); // and an alert stays on top of both
    _slide.start(
        kSlideMilliseconds,
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

} // namespace orvex
