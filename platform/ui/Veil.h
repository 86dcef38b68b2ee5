#pragma once

#include <QWidget>

namespace orvex {

// Dims what lies below it. Takes no input. Hidden at first.
class Veil final : public QWidget {
public:
    explicit Veil(QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace orvex
