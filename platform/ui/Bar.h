#pragma once

#include <QAbstractButton>
#include <QWidget>

namespace orvex {

class TextLabel;

// The surface of a title bar or a toolbar, with a line towards the pages.
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

// A text button of the title bar or the toolbar, in the tint colour. A back button has a chevron before the
// text.
class BarButton final : public QAbstractButton {
public:
    enum class Style { plain, back };

    explicit BarButton(QWidget* parent)
        : BarButton(Style::plain, {}, parent)
    {
    }
    BarButton(Style style, const QString& title, QWidget* parent = nullptr);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    int textLeft() const;

    Style _style;
};

// The bar at the top: the title of the screen on top and, above the root, a button with the title of the
// screen below.
class NavigationBar final : public Bar {
public:
    explicit NavigationBar(QWidget* parent);

    BarButton& backButton() const { return *_backButton; }
    QString title() const { return _title; }
    // An empty back title on the root screen, where there is no button.
    void setTitles(const QString& title, const QString& backTitle, bool showsBackButton);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void layoutTitle();

    QString _title;
    TextLabel* _titleLabel;
    BarButton* _backButton;
};

} // namespace orvex
