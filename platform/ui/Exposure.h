#pragma once

#include <QObject>
#include <QWidget>

#include <functional>

namespace orvex {

// Whether anybody can see a window: it is neither minimized nor hidden by the window system, as on another
// workspace. Covered by other windows it still counts as seen.
class Exposure final : public QObject {
public:
    // Calls back whenever the window comes into sight again. The window owns the object.
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
