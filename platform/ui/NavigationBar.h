#pragma once

#include "Bar.h"

namespace orvex {

class BarButton;
class TextLabel;

// The bar at the top: the title of the screen on top and, above the root, a button with the title of the
// screen below.
class NavigationBar final : public Bar {
public:
    explicit NavigationBar(QWidget* parent);

    BarButton& backButton() const { return *_backButton; }
    QString title() const { return _title; }
    // An empty back title on the root screen, where there is no button.
    void setTitles(const QString& title, const QString& backTitle, bool showsBackButton);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void layoutTitle();

    QString _title;
    TextLabel* _titleLabel;
    BarButton* _backButton;
};

} // namespace orvex
