#pragma once

#include <QWidget>

namespace orvex {

// Dims what lies below it, and takes no input. Hidden until it is shown.
class Veil final : public QWidget {
public:
    explicit Veil(QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace orvex
