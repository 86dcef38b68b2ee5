#pragma once

#include "CoverWatch.h"

#include <QObject>
#include <QWidget>

#include <functional>

namespace orvex {

// Whether a window is visible: neither minimized, nor hidden by the window system, as on another workspace,
// nor wholly covered by other windows where the window system tells (CoverWatch). An invisible window paints
// nothing.
class Exposure final : public QObject {
public:
    // Calls back when the window becomes visible again, before it is painted. The window owns the object.
    Exposure(QWidget& window, std::function<void()> onSeen);

    // True until the window system says otherwise.
    bool isSeen() const { return _isSeen; }

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void setCovered(bool isCovered);
    void update();

    QWidget& _window;
    std::function<void()> _onSeen;
    CoverWatch _cover;
    bool _isCovered = false;
    bool _isSeen = true;
};

} // namespace orvex
