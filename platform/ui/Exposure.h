#pragma once

#include <QObject>
#include <QWidget>

#include <functional>

namespace orvex {

// Whether a window is visible: neither minimized nor hidden by the window system, as on another workspace. A
// window covered by others still counts as visible.
class Exposure final : public QObject {
public:
    // Calls back when the window becomes visible again. The window owns the object.
    Exposure(QWidget& window, std::function<void()> onSeen);

    // True until the window system says otherwise.
    bool isSeen() const { return _isSeen; }

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QWidget& _window;
    std::function<void()> _onSeen;
    bool _isSeen = true;
};

} // namespace orvex
