#include "Bar.h"

#include "TextLabel.h"
#include "Theme.h"

#include <QPainter>

#include <algorithm>

namespace orvex {

namespace {

constexpr int kBarButtonHeight = 36;
constexpr int kBarPadding = 8;
constexpr int kBackChevronWidth = 8;
constexpr int kBackChevronHeight = 15;
constexpr int kChevronGap = 7;

constexpr int kSideMargin = 4;
constexpr int kTitleMargin = 10;
constexpr int kTitleFontSize = 17;
constexpr int kSmallestTitle = 13;       // pixels
constexpr double kBackButtonShare = 0.4; // of the bar, which it may take even if the title must give way

} // namespace

Bar::Bar(QWidget* parent, Line line)
    : QWidget(parent)
    , _line(line)
{
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void Bar::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), Theme::current().bar);
    const int top = _line == Line::above ? 0 : height() - kLineHeight;
    painter.fillRect(QRect(0, top, width(), kLineHeight), Theme::current().barSeparator);
}

BarButton::BarButton(Style style, const QString& title, QWidget* parent)
    : QAbstractButton(parent)
    , _style(style)
{
    setText(title);
    setFont(style == Style::back ? Theme::systemFont(15) : Theme::boldSystemFont(15));
    setFocusPolicy(Qt::TabFocus);
    setCursor(Qt::PointingHandCursor);
}

int BarButton::textLeft() const
{
    return _style == Style::back ? kBarPadding + kBackChevronWidth + kChevronGap : kBarPadding;
}

QSize BarButton::sizeHint() const
{
    return {textLeft() + fontMetrics().horizontalAdvance(text()) + kBarPadding, kBarButtonHeight};
}

QSize BarButton::minimumSizeHint() const
{
    return {textLeft() + kBarPadding, kBarButtonHeight};
}

void BarButton::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    QColor color = Theme::current().tint;
    if (isDown())
        color.setAlphaF(0.4F);
    if (hasFocus()) {
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(QPen(Theme::current().tint, 1.5));
        painter.drawRoundedRect(QRectF(rect()).adjusted(1, 2, -1, -2), 6, 6);
    }
    if (_style == Style::back) {
        const QRectF chevron(
            kBarPadding, (height() - kBackChevronHeight) / 2.0, kBackChevronWidth, kBackChevronHeight);
        drawChevron(painter, chevron, ChevronDirection::left, color, 2.4);
    }
    painter.setPen(color);
    const QRect place(textLeft(), 0, width() - textLeft() - kBarPadding, height());
    const auto side = _style == Style::back ? Qt::AlignLeft : Qt::AlignHCenter;
    // Eliding counts fractions of a pixel, which the size hint rounds off.
    const bool fits = fontMetrics().horizontalAdvance(text()) <= place.width();
    const QString fitted = fits ? text() : fontMetrics().elidedText(text(), Qt::ElideRight, place.width());
    painter.drawText(place, static_cast<int>(side | Qt::AlignVCenter) | Qt::TextSingleLine, fitted);
}

NavigationBar::NavigationBar(QWidget* parent)
    : Bar(parent)
    , _titleLabel(new TextLabel(Theme::boldSystemFont(kTitleFontSize), this))
    , _backButton(new BarButton(BarButton::Style::back, {}, this))
{
    _backButton->hide();
}

void NavigationBar::setTitles(const QString& title, const QString& backTitle, bool showsBackButton)
{
    _title = title;
    _backButton->setText(backTitle);
    _backButton->setAccessibleName(showsBackButton ? QStringLiteral("Back to %1").arg(backTitle) : QString());
    _backButton->setVisible(showsBackButton);
    layoutTitle();
}

// The title is centred, moves aside for a broad back button, then shrinks, and is elided only when all that
// is not enough.
void NavigationBar::layoutTitle()
{
    const QFont usual = Theme::boldSystemFont(kTitleFontSize);
    int left = kTitleMargin;
    if (!_backButton->isHidden()) {
        const int besideTitle =
            (width() - sizeOfLine(_title, usual).width()) / 2 - kTitleMargin - kSideMargin;
        const int widest = std::max(besideTitle, static_cast<int>(width() * kBackButtonShare));
        const QSize size = _backButton->sizeHint();
        _backButton->setGeometry(
            kSideMargin, (height() - size.height()) / 2, std::min(size.width(), widest), size.height());
        left = _backButton->geometry().right() + kTitleMargin;
    }
    const int room = std::max(0, width() - kTitleMargin - left);
    _titleLabel->setFont(fittedFont(usual, _title, room, kSmallestTitle));
    const QFontMetrics metrics(_titleLabel->font());
    const QString fitted = metrics.elidedText(_title, Qt::ElideRight, room);
    const int titleWidth = sizeOfLine(fitted, _titleLabel->font()).width();
    const int centred = (width() - titleWidth) / 2;
    _titleLabel->setLine(fitted);
    _titleLabel->setAccessibleName(_title);
    _titleLabel->setGeometry(std::clamp(centred, left, std::max(left, width() - kTitleMargin - titleWidth)),
        0, titleWidth, height() - 1);
}

void NavigationBar::resizeEvent(QResizeEvent*)
{
    layoutTitle();
}

} // namespace orvex
