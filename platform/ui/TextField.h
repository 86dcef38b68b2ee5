#pragma once

#include <QLineEdit>

namespace orvex {

// One line of text to type, in the colours of the theme.
class TextField final : public QLineEdit {
public:
    explicit TextField(QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace orvex
