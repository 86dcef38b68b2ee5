#include "Theme.h"

#include <QFontDatabase>
#include <QFontInfo>
#include <QGuiApplication>
#include <QPainter>
#include <QPalette>
#include <QPolygonF>

#include <algorithm>

namespace orvex {

namespace {

const Theme& lightTheme()
{
    static const Theme theme{
        .background = QColor(0xFFFFFF),
        .text = QColor(0x111114),
        .secondaryText = QColor(0x45454C),
        .separator = QColor(0xDCDCE0),
        .rowHighlight = QColor(0xD9E7FA),
        .accessory = QColor(0x85858C),
        .bar = QColor(0xF5F5F7),
        .barSeparator = QColor(0xC6C6CB),
        .tint = QColor(0x0A5FCC),
    };
    return theme;
}

const Theme& darkTheme()
{
    static const Theme theme{
        .background = QColor(0x121316),
        .text = QColor(0xF2F2F5),
        .secondaryText = QColor(0xC4C4CC),
        .separator = QColor(0x2E2F35),
        .rowHighlight = QColor(0x24405F),
        .accessory = QColor(0x8D8D95),
        .bar = QColor(0x1E1F24),
        .barSeparator = QColor(0x3A3B42),
        .tint = QColor(0x6CB0FF),
    };
    return theme;
}

const Theme*& theCurrent()
{
    static const Theme* current = &lightTheme();
    return current;
}

QFont fontOfSize(int points)
{
    QFont font = QFontDatabase::systemFont(QFontDatabase::GeneralFont);
    font.setPixelSize(qRound(points * Theme::fontScale()));
    return font;
}

} // namespace

const Theme& Theme::current()
{
    return *theCurrent();
}

bool Theme::isDark()
{
    return theCurrent() == &darkTheme();
}

void Theme::use(Mode mode)
{
    const bool systemIsDark = QGuiApplication::palette().color(QPalette::Window).lightness() < 128;
    const bool isDark = mode == Mode::dark || (mode == Mode::system && systemIsDark);
    const Theme& theme = isDark ? darkTheme() : lightTheme();
    theCurrent() = &theme;

    QPalette palette(theme.bar, theme.background);
    palette.setColor(QPalette::Base, theme.background);
    for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(role, theme.text);
    palette.setColor(QPalette::Highlight, theme.tint);
    palette.setColor(QPalette::HighlightedText, theme.background);
    palette.setColor(QPalette::PlaceholderText, theme.accessory);
    QGuiApplication::setPalette(palette);
}

double Theme::fontScale()
{
    constexpr double kUsualPixels = 11 * 96 / 72.0;
    constexpr double kLargest = 2;
    return std::clamp(QFontInfo(QGuiApplication::font()).pixelSize() / kUsualPixels, 1.0, kLargest);
}

QFont Theme::systemFont(int points)
{
    return fontOfSize(points);
}

QFont Theme::boldSystemFont(int points)
{
    QFont font = fontOfSize(points);
    font.setBold(true);
    return font;
}

void drawChevron(QPainter& painter, const QRectF& rectangle, ChevronDirection direction, const QColor& color,
    double lineWidth)
{
    const bool pointsLeft = direction == ChevronDirection::left;
    const double tip = pointsLeft ? rectangle.left() : rectangle.right();
    const double tail = pointsLeft ? rectangle.right() : rectangle.left();
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(color, lineWidth, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPolyline(QPolygonF{QPointF(tail, rectangle.top()), QPointF(tip, rectangle.center().y()),
        QPointF(tail, rectangle.bottom())});
    painter.restore();
}

} // namespace orvex
