#pragma once

#include "Toolbar.h"

#include <QAbstractButton>
#include <QPointer>
#include <QWidget>

#include <vector>

namespace orvex {

class NavigationStack;

// One page of a navigation stack, with its title and its toolbar items.
class Screen : public QWidget {
public:
    explicit Screen(QWidget* parent = nullptr);
    ~Screen() override;

    QString title() const { return _title; }
    void setTitle(const QString& title);

    void setToolbarItems(std::vector<ToolbarItem> items, bool animated);
    // Null until items are set.
    ToolbarRow* toolbarRow() const { return _toolbarRow; }

    // The stack the screen is on; null before its push and after its pop.
    NavigationStack* navigationStack() const { return _stack; }

    // Called by the stack, before the screen comes into view and before it goes.
    virtual void viewWillAppear(bool /*animated*/) { }
    virtual void viewWillDisappear(bool /*animated*/) { }

    // The widget to focus when the screen comes into view.
    virtual QWidget& firstResponder() { return *this; }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    friend class NavigationStack;

    QString _title;
    QPointer<ToolbarRow> _toolbarRow; // owned; its parent is whichever bar shows it
    NavigationStack* _stack = nullptr;
};

// An invisible background that emits pressed() for a touch beside the widgets it holds.
class TouchArea final : public QAbstractButton {
public:
    explicit TouchArea(QWidget* parent);

protected:
    void paintEvent(QPaintEvent*) override { }
    // Keys that its widgets ignore are for the screen, not for the button.
    // NOLINTBEGIN(bugprone-parent-virtual-call)
    void keyPressEvent(QKeyEvent* event) override { QWidget::keyPressEvent(event); }
    void keyReleaseEvent(QKeyEvent* event) override { QWidget::keyReleaseEvent(event); }
    // NOLINTEND(bugprone-parent-virtual-call)
};

} // namespace orvex
