#pragma once

#include <QAbstractNativeEventFilter>
#include <QByteArray>
#include <QWidget>

#include <functional>

namespace orvex {

// Reports when other windows cover a window wholly, which only an X server tells. Elsewhere, and under a
// window manager that composites, no window ever counts as covered.
class CoverWatch final : public QAbstractNativeEventFilter {
public:
    CoverWatch(WId window, std::function<void(bool isCovered)> onChange);

    bool nativeEventFilter(const QByteArray& eventType, void* message, qintptr* result) override;

private:
    WId _window;
    std::function<void(bool isCovered)> _onChange;
};

} // namespace orvex
