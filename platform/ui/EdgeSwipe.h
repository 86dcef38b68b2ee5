#pragma once

#include <QObject>
#include <QPoint>

#include <optional>

namespace orvex {

class NavigationStack;

// Pops the top screen when a finger or the mouse swipes from the left edge into the stack. It only watches;
// the list below sees the same gesture and does not take it for a tap.
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
