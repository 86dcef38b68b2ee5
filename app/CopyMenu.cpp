#include "CopyMenu.h"

#include "Theme.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMenu>

namespace orvex {

namespace {
constexpr int kMenuFontSize = 15;
}

void copyText(const QString& text)
{
    QGuiApplication::clipboard()->setText(text);
}

void showCopyMenu(QWidget& parent, const QPoint& globalPlace, const QString& row, const QString& screen)
{
    auto* const menu = new QMenu(&parent);
    menu->setAttribute(Qt::WA_DeleteOnClose);
    menu->setFont(Theme::systemFont(kMenuFontSize));
    if (!row.isEmpty())
        menu->addAction(
            QStringLiteral("Copy"), QKeySequence(QKeySequence::Copy), menu, [row] { copyText(row); });
    menu->addAction(QStringLiteral("Copy Screen"), QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_C), menu,
        [screen] { copyText(screen); });
    menu->popup(globalPlace);
}

} // namespace orvex
