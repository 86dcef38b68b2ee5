#include "Notice.h"

#include "Theme.h"

#include <QEvent>
#include <QPainter>
#include <QTextOption>
#include <QTimerEvent>
#include <QtMath>

namespace orvex {

namespace {
constexpr int kNoticeMilliseconds = 5000;
constexpr int kNoticeFontSize = 14;
constexpr int kNoticeMargin = 10;
constexpr int kNoticePadding = 12;
constexpr int kNoticeCornerRadius = 10;
constexpr int kAboveBottom = 54; // clears the toolbar
} // namespace

Notice& Notice::show(QWidget& window, const QString& text)
{
    // Not findChild(), which needs a meta-object of the class.
    for (QObject* const child : window.children()) {
        if (auto* const former = dynamic_cast<Notice*>(child)) {
            former->hide();
            former->deleteLater();
        }
    }
    auto* const notice = new Notice(window, text);
    notice->place();
    notice->QWidget::show();
    notice->raise();
    return *notice;
}

Notice::Notice(QWidget& window, const QString& text)
    : QWidget(&window)
    , _text(text)
{
    setAttribute(Qt::WA_TransparentForMouseEvents);
    setFont(Theme::systemFont(kNoticeFontSize));
    setAccessibleName(text);
    window.installEventFilter(this);
    _shown.start(kNoticeMilliseconds, this);
}

void Notice::place()
{
    const QSize window = parentWidget()->size();
    const int width = window.width() - 2 * kNoticeMargin;
    QTextOption wrapping;
    wrapping.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere); // a path may have no place to break
    _lines = QStaticText(_text);
    _lines.setTextFormat(Qt::PlainText);
    _lines.setTextOption(wrapping);
    _lines.setTextWidth(width - 2 * kNoticePadding);
    _lines.prepare({}, font());
    const int height = qCeil(_lines.size().height()) + 2 * kNoticePadding;
    setGeometry(kNoticeMargin, window.height() - kAboveBottom - height, width, height);
}

bool Notice::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::Resize)
        place();
    return QWidget::eventFilter(watched, event);
}

void Notice::timerEvent(QTimerEvent* event)
{
    if (event->timerId() != _shown.timerId())
        return QWidget::timerEvent(event);
    _shown.stop();
    hide();
    deleteLater();
}

void Notice::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::current();
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(theme.text);
    painter.drawRoundedRect(rect(), kNoticeCornerRadius, kNoticeCornerRadius);
    painter.setPen(theme.background);
    painter.drawStaticText(kNoticePadding, kNoticePadding, _lines);
}

} // namespace orvex
