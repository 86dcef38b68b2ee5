#pragma once

#include <QAbstractButton>

namespace orvex {

// A text button of the title bar or the toolbar. It draws in the tint colour, with a chevron before the text
// where it leads back.
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

} // namespace orvex
