#pragma once

#include <QLabel>
#include <QLineEdit>

namespace orvex {

// One line of plain text: text from a network or a SIM is never read as markup, and its line breaks become
// blanks. Text too long for the label or its parent ends in an ellipsis.
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

// The largest size of the font in which the text has room, not below the smallest; in pixels.
QFont fittedFont(QFont font, const QString& text, int room, int smallest);

// A one-line text field in the colours of the theme.
class TextField final : public QLineEdit {
public:
    explicit TextField(QWidget* parent);

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace orvex
