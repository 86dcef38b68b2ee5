#pragma once

#include "OrvexCell.h"
#include "OrvexPaneController.h"

#include "Array.h"
#include "Dictionary.h"
#include "NavigationStack.h"
#include "NodesByPath.h"
#include "TextLabel.h"

#include <QTest>

#include <gtest/gtest.h>

namespace orvex::test {

// The tree of a display dictionary with its paths.
struct Tree {
    explicit Tree(const Value& display)
        : root(OrvexModelNode::makeTreeFromObject(display, byPath))
    {
    }

    NodesByPath byPath;
    OrvexModelNodeRef root;
};

inline Value rows(std::initializer_list<Dictionary::Entry> entries)
{
    return Dictionary::make(entries);
}

class FakePaneHost final : public PaneHost {
public:
    bool offersSaveButton() const override { return offersSave; }
    void showSaveView() override { ++savesAsked; }

    bool offersSave = false;
    int savesAsked = 0;
};

inline OrvexPaneController& paneAt(const NavigationStack& stack, int index)
{
    return static_cast<OrvexPaneController&>(stack.screenAt(index));
}

inline std::vector<std::string> pathsOn(const NavigationStack& stack)
{
    std::vector<std::string> paths;
    paths.reserve(static_cast<std::size_t>(stack.count()));
    for (int index = 0; index < stack.count(); ++index)
        paths.push_back(paneAt(stack, index).path());
    return paths;
}

// What a row shows: "key" or "key=value".
inline std::string shownAt(const OrvexPaneController& pane, int row)
{
    const auto* const cell = static_cast<OrvexCell*>(pane.tableList().cellAtRow(row));
    if (!cell)
        return "(no cell)";
    const std::string key = cell->key().text().toStdString();
    const bool hasValue = cell->value() && !cell->value()->text().isEmpty();
    return hasValue ? key + "=" + cell->value()->text().toStdString() : key;
}

inline void tapRow(const TableList& list, int row)
{
    const QPoint place(60, row * list.rowHeight() - list.contentOffset() + list.rowHeight() / 2);
    QTest::mouseClick(const_cast<TableList*>(&list), Qt::LeftButton, {}, place);
}

// A stack with the root pane of a tree, in a window of a handset's size.
class PaneFixture : public testing::Test {
protected:
    void show(const Tree& tree)
    {
        stack.reset();
        stack =
            std::make_unique<NavigationStack>(std::make_unique<OrvexPaneController>(host, tree.root, "/"));
        stack->resize(375, 667);
        stack->show();
        // Keys go to the active window.
        QApplication::setActiveWindow(stack.get());
        stack->setFocus();
    }
    void reload(const Tree& tree)
    {
        reloadPanes(*stack, tree.root, [&tree](const std::string& path) { return tree.byPath[path]; });
    }
    OrvexPaneController& top() const { return static_cast<OrvexPaneController&>(stack->topScreen()); }
    void key(Qt::Key pressed) const { QTest::keyClick(&top().tableList(), pressed); }

    FakePaneHost host;
    std::unique_ptr<NavigationStack> stack;
};

} // namespace orvex::test
