#include "Toolbar.h"

#include "Bar.h"
#include "Theme.h"

#include <QAbstractButton>
#include <QGraphicsOpacityEffect>
#include <QHBoxLayout>
#include <QTimer>

namespace orvex {

namespace {

constexpr int kDissolveMilliseconds = 180;
constexpr int kLeftMargin = 10; // in line with the rows
constexpr int kRightMargin = 4; // a button has padding of its own
constexpr int kSpacing = 8;

} // namespace

ToolbarItem ToolbarItem::view(std::unique_ptr<QWidget> widget)
{
    return {Kind::view, std::move(widget)};
}

ToolbarItem ToolbarItem::button(const QString& title, std::function<void()> action)
{
    auto button = std::make_unique<BarButton>(BarButton::Style::plain, title);
    QObject::connect(
        button.get(), &QAbstractButton::clicked, button.get(), [action = std::move(action)] { action(); });
    return {Kind::button, std::move(button)};
}

ToolbarRow::ToolbarRow(std::vector<ToolbarItem> items)
{
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(kLeftMargin, 0, kRightMargin, 0);
    layout->setSpacing(kSpacing);
    for (ToolbarItem& item : items) {
        QWidget* widget = item.takeWidget().release(); // the layout makes it a child
        _items.push_back({item.kind(), widget});
        if (widget)
            layout->addWidget(widget);
        else
            layout->addStretch(1);
    }
    // Opaque, so that a dissolve does not dim what both rows show.
    setAutoFillBackground(true);
    setBackgroundRole(QPalette::Button);
}

QWidget* ToolbarRow::heldButton() const
{
    for (const Item& item : _items) {
        if (item.kind == ToolbarItem::Kind::button && static_cast<QAbstractButton*>(item.widget)->isDown())
            return item.widget;
    }
    return nullptr;
}

void ToolbarRow::replace(ToolbarRow* old, bool animated)
{
    if (!old)
        return;
    for (std::size_t i = 0; i < _items.size() && i < old->_items.size(); ++i) {
        if (_items[i].widget && old->_items[i].widget && old->_items[i].widget->hasFocus())
            _items[i].widget->setFocus();
    }
    if (old->parentWidget())
        old->retire(animated);
    else
        delete old; // never shown
}

void ToolbarRow::retire(bool animated)
{
    if (QWidget* held = heldButton()) {
        raise();
        // After the click that follows the release.
        connect(static_cast<QAbstractButton*>(held), &QAbstractButton::released, this,
            [this] { QTimer::singleShot(0, this, &QObject::deleteLater); });
        return;
    }
    setAttribute(Qt::WA_TransparentForMouseEvents);
    if (!animated || !isVisible()) {
        hide();
        return deleteLater();
    }
    raise();
    auto* effect = new QGraphicsOpacityEffect(this);
    setGraphicsEffect(effect);
    _dissolve.start(
        kDissolveMilliseconds, [effect](double progress) { effect->setOpacity(1 - progress); },
        [this] {
            hide();
            deleteLater();
        });
}

Toolbar::Toolbar(QWidget* parent)
    : Bar(parent, Line::above)
{
}

void Toolbar::showRow(ToolbarRow* row, const ToolbarRow* replaced)
{
    if (_row == row)
        return;
    if (_row && _row != replaced)
        _row->hide();
    _row = row;
    if (!row)
        return;
    row->setParent(this);
    place(*row);
    row->show();
}

void Toolbar::place(QWidget& row) const
{
    row.setGeometry(0, kLineHeight, width(), height() - kLineHeight);
}

void Toolbar::resizeEvent(QResizeEvent*)
{
    if (_row)
        place(*_row);
}

} // namespace orvex
