#include "OrvexPaneController.h"

#include "CopyMenu.h"
#include "Indicators.h"
#include "NavigationStack.h"
#include "NodesByPath.h"
#include "OrvexCell.h"
#include "RowText.h"
#include "TextLabel.h"
#include "Theme.h"
#include "VisibleText.h"

#include <QKeyEvent>

#include <algorithm>
#include <utility>

namespace orvex {

namespace {

// Shared by branches and leaves, although a cell keeps its kind: in a list of both, a reused cell may be of
// the other kind than its row.
constexpr const char* kRowCellIdentifier = "OrvexPaneControllerCell";
constexpr int kStatusFontSize = 14;
constexpr double kBesidesStatus =
    70; // of the toolbar's width: margins and Save button, which grows with the font

// The row of the child with the name: the former row if it still has that name, else the first that does.
std::optional<int> rowNamed(const std::string& name, const OrvexModelNode* node, int formerRow)
{
    const auto* const children = node ? node->childNodes() : nullptr;
    if (!children)
        return std::nullopt;
    const auto hasName = [&name](const OrvexModelNodeRef& child) { return child->displayName() == name; };
    const auto former = static_cast<std::size_t>(formerRow);
    if (former < children->size() && hasName((*children)[former]))
        return formerRow;
    const auto found = std::ranges::find_if(*children, hasName);
    if (found == children->end())
        return std::nullopt;
    return static_cast<int>(found - children->begin());
}

} // namespace

OrvexPaneController::OrvexPaneController(PaneHost& host, OrvexModelNodeRef node, std::string path)
    : _host(host)
    , _nodes(std::move(node))
    , _keyPath(std::move(path))
    , _list(new TableList(*this, this))
{
    updateTitle();
    _list->reloadData();
}

void OrvexPaneController::updateTitle()
{
    const QString title =
        _nodes ? QString::fromStdString(visibleText(_nodes->displayName())) : QStringLiteral("Orvex");
    setTitle(title);
    _list->setAccessibleName(title);
}

void OrvexPaneController::setStatus(const std::optional<std::string>& status, bool isLoading)
{
    _status = status.value_or("");
    _isLoading = isLoading;
    createToolbarItems();
}

void OrvexPaneController::reloadWithNode(OrvexModelNodeRef node)
{
    const OrvexModelNodeRef former = std::exchange(_nodes, std::move(node));
    updateTitle();
    _list->reloadData([&](int row) {
        const auto& child = former->childNodes()->at(static_cast<std::size_t>(row));
        return rowNamed(child->displayName(), _nodes.get(), row);
    });
    createToolbarItems();
}

void OrvexPaneController::viewWillAppear(bool animated)
{
    Screen::viewWillAppear(animated);
    updateTitle();
    if (navigationStack())
        navigationStack()->setToolbarHidden(false);
    createToolbarItems();
}

void OrvexPaneController::viewWillDisappear(bool)
{
    _list->clearFocus();
}

void OrvexPaneController::resizeEvent(QResizeEvent*)
{
    _list->setGeometry(rect());
}

int OrvexPaneController::numberOfRows(const TableList&) const
{
    const auto* const children = _nodes ? _nodes->childNodes() : nullptr;
    return children ? static_cast<int>(children->size()) : 0;
}

const OrvexModelNode& OrvexPaneController::childAtRow(int row) const
{
    return *_nodes->childNodes()->at(static_cast<std::size_t>(row));
}

std::unique_ptr<TableCell> OrvexPaneController::cellForRow(TableList& list, int row)
{
    const OrvexModelNode& child = childAtRow(row);
    const bool isBranch = child.childNodes() != nullptr;
    std::unique_ptr<TableCell> reused = list.dequeueReusableCell(kRowCellIdentifier);
    if (!reused)
        reused = std::make_unique<OrvexCell>(
            isBranch ? OrvexCell::Kind::branch : OrvexCell::Kind::leaf, kRowCellIdentifier);

    auto& cell = static_cast<OrvexCell&>(*reused); // the only kind this screen makes
    cell.setKey(QString::fromStdString(child.displayName()));
    if (isBranch) {
        cell.setAccessory(TableCell::Accessory::disclosureIndicator);
        cell.setValue({});
        cell.setLayoutKey();
    } else {
        cell.setAccessory(TableCell::Accessory::none);
        cell.setValue(child.value() ? QString::fromStdString(*child.value()) : QString());
        cell.setLayout();
    }
    return reused;
}

void OrvexPaneController::didSelectRow(TableList& list, std::optional<int> row)
{
    if (!row)
        return;
    const OrvexModelNodeRef child = _nodes->childNodes()->at(static_cast<std::size_t>(*row));
    if (!child->childNodes())
        return list.deselectRow();
    openRow(*row, true);
}

void OrvexPaneController::openRow(int row, bool animated)
{
    // A press may end after the screen was popped or covered.
    if (!navigationStack() || &navigationStack()->topScreen() != this)
        return;
    const OrvexModelNodeRef child = _nodes->childNodes()->at(static_cast<std::size_t>(row));
    auto screen =
        std::make_unique<OrvexPaneController>(_host, child, pathByAppending(_keyPath, child->displayName()));
    screen->setStatus(_status, _isLoading);
    navigationStack()->push(std::move(screen), animated);
}

bool OrvexPaneController::goToRow(const std::string& name)
{
    const auto row = rowNamed(name, _nodes.get(), 0);
    if (!row)
        return false;
    _list->scrollToRow(*row);
    _list->selectRow(*row);
    if (childAtRow(*row).childNodes())
        openRow(*row, false);
    return true;
}

QString OrvexPaneController::textOfRow(std::optional<int> row) const
{
    return row && *row < numberOfRows(*_list) ? rowText(childAtRow(*row)) : QString();
}

void OrvexPaneController::wantsMenu(TableList&, std::optional<int> row, const QPoint& globalPlace)
{
    showCopyMenu(*this, globalPlace, textOfRow(row), screenText(_nodes.get()));
}

void OrvexPaneController::keyPressEvent(QKeyEvent* event)
{
    const QKeySequence copyScreen(Qt::CTRL | Qt::SHIFT | Qt::Key_C);
    if (event->matches(QKeySequence::Copy) && _list->currentRow())
        copyText(textOfRow(_list->currentRow()));
    else if (event->matches(QKeySequence::Copy) || QKeySequence(event->keyCombination()) == copyScreen)
        copyText(screenText(_nodes.get()));
    else if (!typeAhead(*event))
        Screen::keyPressEvent(event);
}

bool OrvexPaneController::typeAhead(const QKeyEvent& event)
{
    const QString text = event.text();
    const bool isPlain = (event.modifiers() & ~(Qt::ShiftModifier | Qt::KeypadModifier)) == Qt::NoModifier;
    if (!isPlain || text.isEmpty() || !text[0].isPrint()
        || (text == QLatin1String(" ") && !_typeAhead.isTyping()))
        return false;
    _typeAhead.type(text);
    const auto nameOf = [this](int row) { return QString::fromStdString(childAtRow(row).displayName()); };
    if (const auto row = _typeAhead.row(numberOfRows(*_list), _list->currentRow().value_or(-1), nameOf)) {
        _list->scrollToRow(*row);
        _list->selectRow(*row);
    }
    return true;
}

void OrvexPaneController::createToolbarItems()
{
    auto indicator = std::make_unique<ActivityIndicator>();
    if (_isLoading)
        indicator->startAnimating();
    else
        indicator->stopAnimating();

    const int room = width() - qRound(kBesidesStatus * Theme::fontScale());
    auto label = std::make_unique<TextLabel>(fittedFont(
        Theme::systemFont(kStatusFontSize), QString::fromStdString(_status), room, kStatusFontSize));
    label->setLine(QString::fromStdString(_status));
    label->setAccessibleDescription(QStringLiteral("Status"));
    label->adjustSize();
    _statusLabel = label.get();

    std::vector<ToolbarItem> items;
    items.push_back(ToolbarItem::view(std::move(indicator)));
    items.push_back(ToolbarItem::view(std::move(label)));
    items.push_back(ToolbarItem::flexibleSpace());
    if (_host.offersSaveButton())
        items.push_back(
            ToolbarItem::button(QStringLiteral("Save"), [host = &_host] { host->showSaveView(); }));
    setToolbarItems(std::move(items), true);
}

void reloadPanes(NavigationStack& stack, const OrvexModelNodeRef& root,
    const std::function<OrvexModelNodeRef(const std::string& path)>& nodeAtPath)
{
    for (int index = 0; index < stack.count(); ++index) {
        auto& pane = static_cast<OrvexPaneController&>(stack.screenAt(index)); // the only kind on this stack
        OrvexModelNodeRef node = index == 0 ? root : nodeAtPath(pane.path());
        if (!node && index > 0)
            return stack.popTo(index - 1, true);
        pane.reloadWithNode(std::move(node));
    }
}

} // namespace orvex
