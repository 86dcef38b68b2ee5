#pragma once

#include "TreeSearch.h"

#include "Screen.h"
#include "TableList.h"

#include <functional>
#include <memory>

namespace orvex {

class Bar;
class BarButton;
class TextField;
class TextLabel;

// Searches the display tree as it was when the screen opened: a field above a list of matching rows and their
// paths. Return or a tap chooses one; arrow keys move in the list while the field keeps the focus.
class FindScreen final : public Screen, public TableList::DataSource {
public:
    struct Actions {
        std::function<void(const FoundRow& row)> choose;
        std::function<void()> cancel;
    };

    // Null is an empty tree. The actions must not delete the screen immediately.
    FindScreen(OrvexModelNodeRef root, Actions actions);

    TextField& field() const { return *_field; }
    TableList& results() const { return *_results; }

    QWidget& firstResponder() override;

    int numberOfRows(const TableList& list) const override;
    std::unique_ptr<TableCell> cellForRow(TableList& list, int row) override;
    void didSelectRow(TableList& list, std::optional<int> row) override;

    bool eventFilter(QObject* watched, QEvent* event) override;

protected:
    void resizeEvent(QResizeEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    void search(const QString& text);

    OrvexModelNodeRef _root;
    Actions _actions;
    std::vector<FoundRow> _found;
    Bar* _bar; // children
    TextField* _field;
    BarButton* _cancel;
    TableList* _results;
    TextLabel* _nothing; // shown if nothing matches
};

} // namespace orvex
