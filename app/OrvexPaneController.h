#pragma once

#include "OrvexModelNode.h"
#include "Screen.h"
#include "TableList.h"
#include "TypeAhead.h"

#include <QLabel>
#include <QPointer>

#include <functional>
#include <optional>
#include <string>

namespace orvex {

class NavigationStack;

// What a list screen needs of the application.
class PaneHost {
public:
    virtual ~PaneHost() = default;

    // Whether the toolbar has a Save button.
    virtual bool offersSaveButton() const = 0;
    virtual void showSaveView() = 0;
};

// The list screen of a node of the display tree: a row for each child. A branch opens a screen of its own, a
// leaf shows name and value. Keeps its node, and so its rows, until it gets another.
class OrvexPaneController final : public Screen, public TableList::DataSource {
public:
    // The node is null on the root screen until there is a tree. The host outlives the screen.
    OrvexPaneController(PaneHost& host, OrvexModelNodeRef node, std::string path);

    const OrvexModelNodeRef& node() const { return _nodes; }
    const std::string& path() const { return _keyPath; }
    const std::string& status() const { return _status; }
    bool isLoading() const { return _isLoading; }
    // The status in the toolbar. Every change of the toolbar makes a new label.
    const QLabel* statusLabel() const { return _statusLabel; }
    TableList& tableList() const { return *_list; }

    // An absent status counts as empty.
    void setStatus(const std::optional<std::string>& status, bool isLoading);
    void reloadWithNode(OrvexModelNodeRef node);
    // Selects the row of that name and, if it is a branch, opens it at once. False when there is none.
    bool goToRow(const std::string& name);

    QWidget& firstResponder() override { return *_list; }
    void viewWillAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;

    int numberOfRows(const TableList& list) const override;
    std::unique_ptr<TableCell> cellForRow(TableList& list, int row) override;
    void didSelectRow(TableList& list, std::optional<int> row) override;
    // Copies the row or the screen.
    void wantsMenu(TableList& list, std::optional<int> row, const QPoint& globalPlace) override;

protected:
    void resizeEvent(QResizeEvent* event) override;
    // Copying, and going to a row by the beginning of its name.
    void keyPressEvent(QKeyEvent* event) override;

private:
    const OrvexModelNode& childAtRow(int row) const;
    QString textOfRow(std::optional<int> row) const;
    void openRow(int row, bool animated);
    bool typeAhead(const QKeyEvent& event);
    void updateTitle();
    void createToolbarItems();

    PaneHost& _host;
    OrvexModelNodeRef _nodes; // the node whose children are listed
    std::string _keyPath;
    std::string _status;
    bool _isLoading = true;
    QPointer<QLabel> _statusLabel; // the toolbar row's
    TableList* _list;              // child
    TypeAhead _typeAhead;
};

// Gives every list screen of the stack its node in the new tree, from the root up. Pops the first screen
// whose path is gone and all above it, animated. The root screen gets the root even if that is null.
void reloadPanes(NavigationStack& stack, const OrvexModelNodeRef& root,
    const std::function<OrvexModelNodeRef(const std::string& path)>& nodeAtPath);

} // namespace orvex
