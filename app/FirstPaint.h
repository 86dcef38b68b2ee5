#pragma once

#include <QObject>

#include <functional>

namespace orvex {

// Tells once when the application's first window has been painted.
class FirstPaint final : public QObject {
public:
    explicit FirstPaint(std::function<void()> onPainted);

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    std::function<void()> _onPainted; // empty once it is on its way
};

} // namespace orvex
