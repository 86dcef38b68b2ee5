#include "FindScreen.h"

#include "FoundRowCell.h"

#include "Bar.h"
#include "TextLabel.h"
#include "Theme.h"
#include "VisibleText.h"

#include <QCoreApplication>
#include <QKeyEvent>

#include <algorithm>

namespace orvex {

namespace {

constexpr const char* kFoundCellIdentifier = "FoundRow";
constexpr int kFieldMargin = 10;
constexpr int kFieldHeight = 34;
constexpr int kFieldFontSize = 15;

bool movesInList(int key)
{
    constexpr int kKeys[] = {Qt::Key_Up, Qt::Key_Down, Qt::Key_PageUp, Qt::Key_PageDown};
    return std::ranges::find(kKeys, key) != std::end(kKeys);
}

// The branches on the way to the row.
QString placeOf(const FoundRow& row)
{
    std::string place;
    for (std::size_t i = 0; i + 1 < row.names.size(); ++i)
        place += (i == 0 ? "" : " / ") + visibleText(row.names[i]);
    return QString::fromStdString(place);
}

} // namespace

FindScreen::FindScreen(OrvexModelNodeRef root, Actions actions)
    : _root(std::move(root))
    , _actions(std::move(actions))
    , _bar(new Bar(this))
    , _field(new TextField(_bar))
    , _cancel(new BarButton(BarButton::Style::plain, QStringLiteral("Cancel"), _bar))
    , _results(new TableList(*this, this))
    , _nothing(new TextLabel(Theme::systemFont(kFieldFontSize), _results))
{
    setTitle(QStringLiteral("Find"));
    _field->setPlaceholderText(QStringLiteral("Name or value"));
    _field->setAccessibleName(QStringLiteral("Find"));
    _field->installEventFilter(this);
    _results->setAccessibleName(QStringLiteral("Rows found"));
    _nothing->setLine(QStringLiteral("No row has this text."));
    _nothing->hide();
    connect(_field, &QLineEdit::textChanged, this, [this](const QString& text) { search(text); });
    connect(_field, &QLineEdit::returnPressed, this,
        [this] { didSelectRow(*_results, _results->selectedRow().value_or(0)); });
    connect(_cancel, &BarButton::clicked, this, [this] { _actions.cancel(); });
}

QWidget& FindScreen::firstResponder()
{
    return *_field;
}

void FindScreen::search(const QString& text)
{
    _found = _root ? searchTree(*_root, text) : std::vector<FoundRow>();
    _results->deselectRow();
    _results->setContentOffset(0);
    _results->reloadData();
    _nothing->setVisible(_found.empty() && !text.isEmpty());
}

int FindScreen::numberOfRows(const TableList&) const
{
    return static_cast<int>(_found.size());
}

std::unique_ptr<TableCell> FindScreen::cellForRow(TableList& list, int row)
{
    std::unique_ptr<TableCell> reused = list.dequeueReusableCell(kFoundCellIdentifier);
    if (!reused)
        reused = std::make_unique<FoundRowCell>(kFoundCellIdentifier);
    const FoundRow& found = _found[static_cast<std::size_t>(row)];
    const std::string* const value = found.node->value();
    reused->setAccessory(value ? TableCell::Accessory::none : TableCell::Accessory::disclosureIndicator);
    static_cast<FoundRowCell&>(*reused).setTexts(QString::fromStdString(visibleText(found.names.back())),
        value ? QString::fromStdString(visibleText(*value)) : QString(), placeOf(found));
    return reused;
}

void FindScreen::didSelectRow(TableList&, std::optional<int> row)
{
    if (row && *row < static_cast<int>(_found.size()))
        _actions.choose(_found[static_cast<std::size_t>(*row)]);
}

bool FindScreen::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == _field && event->type() == QEvent::KeyPress
        && movesInList(static_cast<QKeyEvent*>(event)->key()))
        return QCoreApplication::sendEvent(_results, event);
    return Screen::eventFilter(watched, event);
}

void FindScreen::resizeEvent(QResizeEvent*)
{
    const QSize cancel = _cancel->sizeHint();
    const int middle = Bar::kHeight / 2;
    _bar->setGeometry(0, 0, width(), Bar::kHeight);
    _cancel->setGeometry(
        width() - cancel.width(), middle - cancel.height() / 2, cancel.width(), cancel.height());
    _field->setGeometry(
        kFieldMargin, middle - kFieldHeight / 2, width() - cancel.width() - kFieldMargin, kFieldHeight);
    _results->setGeometry(0, Bar::kHeight, width(), height() - Bar::kHeight);
    _nothing->setGeometry(kFieldMargin, 0, width() - 2 * kFieldMargin, TableList::kDefaultRowHeight);
}

void FindScreen::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Escape)
        _actions.cancel();
    else
        Screen::keyPressEvent(event);
}

} // namespace orvex
