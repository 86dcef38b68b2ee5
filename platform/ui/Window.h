#pragma once

#include "Animation.h"
#include "Screen.h"

#include <QObject>
#include <QPointer>
#include <QWidget>

#include <functional>
#include <memory>
#include <optional>

namespace orvex {

// The application's window: a root view that fills it, and at most one modal screen that slides in over it.
class Window final : public QWidget {
public:
    // With the bounds of the main screen unless another size is given.
    explicit Window(const QString& title, const std::optional<QSize>& size = std::nullopt);

    void setRootView(std::unique_ptr<QWidget> view);

    // Covers the root view until it is dismissed. One screen at a time.
    void presentModally(std::unique_ptr<Screen> screen, bool animated);
    void dismissModal(bool animated);
    Screen* modalScreen() const { return _modal; }

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    QWidget* _root = nullptr; // child
    QPointer<Screen> _modal;  // child
    Transition _slide{this};
};

// Calls back once, when the application's first window has been painted.
class FirstPaint final : public QObject {
public:
    explicit FirstPaint(std::function<void()> onPainted);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    std::function<void()> _onPainted; // empty once the call is queued
};

// Tells assistive technology which widgets are lists, rows and progress indicators. Call it once.
void installAccessibility();

} // namespace orvex
