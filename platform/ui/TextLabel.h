#pragma once

#include <QLabel>

namespace orvex {

// One line of plain text. What a network or a SIM sends is shown as it is, never read as markup, and a line
// break in it does not break the row. Text that runs beyond the label or its parent ends in an ellipsis.
class TextLabel final : public QLabel {
public:
    explicit TextLabel(QWidget* parent)
        : TextLabel(QFont(), parent)
    {
    }
    explicit TextLabel(const QFont& font, QWidget* parent = nullptr);

    void setLine(const QString& text);

protected:
    void paintEvent(QPaintEvent* event) override;
};

// The size of one line of text as a label draws it, in whole pixels.
QSize sizeOfLine(const QString& text, const QFont& font);

} // namespace orvex
