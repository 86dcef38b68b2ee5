#pragma once

#include <QWidget>

namespace orvex {

// The surface of a title bar or a toolbar, with a line towards the screen beside it.
class Bar : public QWidget {
public:
    enum class Line { above, below };

    static constexpr int kHeight = 44;
    static constexpr int kLineHeight = 1;

    explicit Bar(QWidget* parent, Line line = Line::below);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    Line _line;
};

} // namespace orvex
