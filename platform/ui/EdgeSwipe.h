#pragma once

#include <QObject>
#include <QPoint>

#include <optional>

namespace orvex {

class NavigationStack;

// Pops the top screen when a finger or the mouse is drawn from the left edge into the stack. It only watches:
// the list below gets the same gesture, which is no tap to it.
class EdgeSwipe final : public QObject {
public:
    // The stack owns the object.
    explicit EdgeSwipe(NavigationStack& stack);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    NavigationStack& _stack;
    std::optional<QPoint> _start; // of a press at the edge
};

} // namespace orvex
