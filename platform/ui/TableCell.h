#pragma once

#include <QWidget>

#include <string>

class QPainter;

namespace orvex {

class SidewaysScrollView;

// One row of a table list: a content view, an accessory at its right, a highlight and the line below.
//
// Cells take no input; the list does.
class TableCell : public QWidget {
public:
    enum class Accessory { none, disclosureIndicator, checkmark };

    // Right of the content view, so that a value set flush right does not touch the edge of the window.
    static constexpr int kRightInset = 10;

    explicit TableCell(std::string reuseIdentifier);

    const std::string& reuseIdentifier() const { return _reuseIdentifier; }
    QWidget* contentView() const { return _contentView; }

    Accessory accessory() const { return _accessory; }
    void setAccessory(Accessory accessory);
    bool isHighlighted() const { return _isHighlighted; }
    void setHighlighted(bool highlighted);

    // Places the content view. Called whenever the size or the accessory changes.
    virtual void layoutSubviews();
    // What a sideways gesture on the row scrolls; null when there is nothing.
    virtual SidewaysScrollView* sidewaysScrollView() const { return nullptr; }

    // The row that the list shows in this cell or last showed in it, -1 before the first.
    int row() const { return _row; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    friend class TableList;

    void drawCheckmark(QPainter& painter) const;
    void drawMoreMark(QPainter& painter) const;

    std::string _reuseIdentifier;
    QWidget* _contentView;
    Accessory _accessory = Accessory::none;
    bool _isHighlighted = false;
    int _row = -1;
};

} // namespace orvex
