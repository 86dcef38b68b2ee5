#include "NavigationBar.h"

#include "BarButton.h"
#include "TextLabel.h"
#include "Theme.h"

#include <algorithm>

namespace orvex {

namespace {
constexpr int kSideMargin = 4;
constexpr int kTitleMargin = 10;
constexpr double kBackButtonShare = 0.4; // of the width, which it may have even if the title must give way
} // namespace

NavigationBar::NavigationBar(QWidget* parent)
    : Bar(parent)
    , _titleLabel(new TextLabel(Theme::boldSystemFont(17), this))
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

// The title stands in the middle of the bar, moves aside for a broad back button and is cut only when that
// does not suffice.
void NavigationBar::layoutTitle()
{
    int left = kTitleMargin;
    if (!_backButton->isHidden()) {
        const int besideTitle =
            (width() - sizeOfLine(_title, _titleLabel->font()).width()) / 2 - kTitleMargin - kSideMargin;
        const int widest = std::max(besideTitle, static_cast<int>(width() * kBackButtonShare));
        const QSize size = _backButton->sizeHint();
        _backButton->setGeometry(
            kSideMargin, (height() - size.height()) / 2, std::min(size.width(), widest), size.height());
        left = _backButton->geometry().right() + kTitleMargin;
    }
    const int room = std::max(0, width() - kTitleMargin - left);
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
