#pragma once

#include "Animation.h"
#include "Screen.h"
#include "Veil.h"

#include <memory>
#include <vector>

namespace orvex {

class NavigationBar;
class Toolbar;

// Shows the top screen of a stack, between a title bar with a back button and a toolbar. Pushes and pops
// slide; a new one finishes a running one first. Escape, Backspace and the back key pop.
class NavigationStack final : public QWidget {
public:
    class Delegate {
    public:
        virtual ~Delegate() = default;
        // The screen comes into view: by a push or a pop, or as the root of a stack shown for the first time,
        // then in the next turn of the event loop.
        virtual void willShowScreen(NavigationStack& stack, Screen& screen, bool animated) = 0;
    };

    explicit NavigationStack(std::unique_ptr<Screen> root, QWidget* parent = nullptr);

    // Not owned: clear it before it is deleted.
    void setDelegate(Delegate* delegate) { _delegate = delegate; }

    int count() const { return static_cast<int>(_screens.size()); }
    Screen& screenAt(int index) const { return *_screens[static_cast<std::size_t>(index)]; }
    Screen& topScreen() const { return *_screens.back(); }
    NavigationBar& navigationBar() const { return *_bar; }

    void push(std::unique_ptr<Screen> screen, bool animated);
    // The root stays.
    void pop(bool animated) { popTo(count() - 2, animated); }
    // Drops every screen above the index. Screens are deleted in the event loop after the slide, so a screen
    // may pop itself.
    void popTo(int index, bool animated);
    bool isAnimating() const { return _slide.isRunning(); }

    void setToolbarHidden(bool hidden);
    // Dims the screens, but not the bars.
    void setDimmed(bool dimmed) { _veil->setVisible(dimmed); }

    // Called by screens.
    void titleChanged();
    void toolbarRowChanged(const Screen& screen, const ToolbarRow* replaced);

protected:
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    enum class Direction { push, pop };

    void adopt(std::unique_ptr<Screen> screen);
    void announce(Screen& leaving, bool animated);
    void slide(Screen& leaving, Direction direction, bool animated);
    void layoutParts();

    NavigationBar* _bar;
    QWidget* _pages;
    QWidget* _edge; // between the two screens of a slide, child of _pages
    Veil* _veil;    // over _pages
    Toolbar* _toolbar;
    std::vector<Screen*> _screens; // children of _pages
    Delegate* _delegate = nullptr;
    bool _rootHasAppeared = false;
    Transition _slide{this};
};

} // namespace orvex
