#pragma once

#include "PaneHost.h"

#include "OrvexModelNode.h"
#include "Screen.h"
#include "TableList.h"

#include <QLabel>
#include <QPointer>

#include <optional>
#include <string>

namespace orvex {

// The list screen of one node of the display tree: a row for every child. A branch opens a screen of its own,
// a leaf shows name and value. Keeps its node, and so keeps its rows, until it is given another one.
class OrvexPaneController final : public Screen, public TableList::DataSource {
public:
    // The node is null on the root screen until there is a tree. The host outlives the screen.
    OrvexPaneController(PaneHost& host, OrvexModelNodeRef node, std::string path);

    const std::string& path() const { return _keyPath; }
    const std::string& status() const { return _status; }
    bool isLoading() const { return _isLoading; }
    // Shows the status in the toolbar; each change of the toolbar brings another.
    const QLabel* statusLabel() const { return _statusLabel; }
    TableList& tableList() const { return *_list; }

    // No status is an empty one.
    void setStatus(const std::optional<std::string>& status, bool isLoading);
    void reloadWithNode(OrvexModelNodeRef node);

    QWidget& firstResponder() override { return *_list; }
    void viewWillAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;

    int numberOfRows(const TableList& list) const override;
    std::unique_ptr<TableCell> cellForRow(TableList& list, int row) override;
    void didSelectRow(TableList& list, std::optional<int> row) override;

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    const OrvexModelNode& childAtRow(int row) const;
    void updateTitle();
    void createToolbarItems();

    PaneHost& _host;
    OrvexModelNodeRef _nodes; // the node whose children are listed
    std::string _keyPath;
    std::string _status;
    bool _isLoading = true;
    QPointer<QLabel> _statusLabel; // the toolbar row's
    TableList* _list;              // child
};

} // namespace orvex
