#include "NavigationStack.h"

#include "Bar.h"
#include "Theme.h"
#include "Toolbar.h"

#include <QKeyEvent>

namespace orvex {

namespace {
constexpr int kPushMilliseconds = 250;
constexpr double kParallax = 0.3; // how far the lower screen moves, in widths
} // namespace

NavigationStack::NavigationStack(std::unique_ptr<Screen> root, QWidget* parent)
    : QWidget(parent)
    , _bar(new NavigationBar(this))
    , _pages(new QWidget(this))
    , _edge(new QWidget(_pages))
    , _veil(new Veil(this))
    , _toolbar(new Toolbar(this))
{
    QPalette edgePalette;
    edgePalette.setColor(QPalette::Window, Theme::current().barSeparator);
    _edge->setPalette(edgePalette);
    _edge->setAutoFillBackground(true);
    _edge->hide();
    connect(&_bar->backButton(), &QAbstractButton::clicked, this, [this] { pop(true); });
    adopt(std::move(root));
    titleChanged();
    _toolbar->showRow(topScreen().toolbarRow());
}

void NavigationStack::adopt(std::unique_ptr<Screen> screen)
{
    Screen* const adopted = screen.release();
    adopted->setParent(_pages);
    adopted->_stack = this;
    adopted->setGeometry(_pages->rect());
    _screens.push_back(adopted);
}

void NavigationStack::push(std::unique_ptr<Screen> screen, bool animated)
{
    _slide.finish();
    Screen& leaving = topScreen();
    adopt(std::move(screen));
    announce(leaving, animated);
    slide(leaving, Direction::push, animated);
}

void NavigationStack::popTo(int index, bool animated)
{
    if (index < 0 || index >= count() - 1)
        return;
    _slide.finish();
    Screen& leaving = topScreen();
    for (int above = index + 1; above < count(); ++above) {
        Screen& popped = screenAt(above);
        popped._stack = nullptr;
        if (&popped == &leaving)
            continue; // slides out first
        popped.hide();
        popped.deleteLater();
    }
    _screens.resize(static_cast<std::size_t>(index) + 1);
    announce(leaving, animated);
    slide(leaving, Direction::pop, animated);
}

void NavigationStack::announce(Screen& leaving, bool animated)
{
    leaving.viewWillDisappear(animated);
    topScreen().viewWillAppear(animated);
    if (_delegate)
        _delegate->willShowScreen(*this, topScreen(), animated);
    titleChanged();
    _toolbar->showRow(topScreen().toolbarRow());
}

void NavigationStack::slide(Screen& leaving, Direction direction, bool animated)
{
    Screen& arriving = topScreen();
    const bool isPush = direction == Direction::push;
    arriving.setGeometry(_pages->rect());
    arriving.show();
    (isPush ? arriving : leaving).raise();
    _edge->raise();
    _edge->show();
    arriving.firstResponder().setFocus();
    // A second tap meant for the old screen must not hit the new one.
    _pages->setAttribute(Qt::WA_TransparentForMouseEvents);

    const auto step = [this, &leaving, &arriving, isPush](double progress) {
        const double covered =
            isPush ? progress : 1 - progress; // share of the width that the upper screen covers
        const int upper = qRound((1 - covered) * _pages->width());
        const int lower = qRound(-covered * kParallax * _pages->width());
        _edge->setGeometry(upper - 1, 0, 1, _pages->height());
        leaving.move(isPush ? lower : upper, 0);
        arriving.move(isPush ? upper : lower, 0);
    };
    const auto end = [this, &leaving, isPush] {
        _pages->setAttribute(Qt::WA_TransparentForMouseEvents, false);
        _edge->hide();
        leaving.hide();
        if (!isPush)
            leaving.deleteLater();
    };
    _slide.start(animated && isVisible() ? kPushMilliseconds : 0, step, end);
    if (!animated || !isVisible())
        _slide.finish();
}

void NavigationStack::titleChanged()
{
    const bool hasBack = count() > 1;
    _bar->setTitles(topScreen().title(), hasBack ? screenAt(count() - 2).title() : QString(), hasBack);
}

void NavigationStack::toolbarRowChanged(const Screen& screen, const ToolbarRow* replaced)
{
    if (&screen == &topScreen())
        _toolbar->showRow(screen.toolbarRow(), replaced);
}

void NavigationStack::setToolbarHidden(bool hidden)
{
    _toolbar->setVisible(!hidden);
    layoutParts();
}

void NavigationStack::layoutParts()
{
    const int toolbarHeight = _toolbar->isHidden() ? 0 : Toolbar::kHeight;
    _bar->setGeometry(0, 0, width(), NavigationBar::kHeight);
    _toolbar->setGeometry(0, height() - toolbarHeight, width(), Toolbar::kHeight);
    const QRect pages(0, NavigationBar::kHeight, width(), height() - NavigationBar::kHeight - toolbarHeight);
    if (pages == _pages->geometry())
        return;
    _slide.finish();
    _pages->setGeometry(pages);
    _veil->setGeometry(pages);
    topScreen().setGeometry(_pages->rect());
}

void NavigationStack::resizeEvent(QResizeEvent*)
{
    layoutParts();
}

void NavigationStack::showEvent(QShowEvent* event)
{
    if (!_rootHasAppeared) {
        _rootHasAppeared = true;
        topScreen().viewWillAppear(false);
        // Later: whoever shows the stack has yet to set up what it shows.
        const auto announceRoot = [this] {
            if (_delegate && count() == 1)
                _delegate->willShowScreen(*this, topScreen(), false);
        };
        QMetaObject::invokeMethod(this, announceRoot, Qt::QueuedConnection);
    }
    QWidget::showEvent(event);
}

// Not a focus proxy: with one, the Tab key never reaches the back button.
void NavigationStack::focusInEvent(QFocusEvent*)
{
    topScreen().firstResponder().setFocus();
}

void NavigationStack::keyPressEvent(QKeyEvent* event)
{
    const int key = event->key();
    const bool goesBack = key == Qt::Key_Escape || key == Qt::Key_Backspace || key == Qt::Key_Back;
    if (!goesBack || count() == 1)
        return QWidget::keyPressEvent(event);
    pop(true);
}

void NavigationStack::mouseReleaseEvent(QMouseEvent* event)
{
    if (event->button() == Qt::BackButton)
        return pop(true);
    QWidget::mouseReleaseEvent(event);
}

} // namespace orvex
