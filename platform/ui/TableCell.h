#pragma once

#include <QWidget>

#include <string>

class QPainter;

namespace orvex {

// A view of part of a wider content. It takes no input: its list scrolls it.
class SidewaysScrollView final : public QWidget {
public:
    explicit SidewaysScrollView(QWidget* parent);

    // The parent for what is to scroll.
    QWidget* content() const { return _content; }
    QSize contentSize() const { return _content->size(); }
    void setContentSize(const QSize& size);

    int offset() const { return _offset; }
    int maximumOffset() const { return qMax(0, _content->width() - width()); }
    // Whether some content is out of view to the right.
    bool hidesContentAtRight() const;
    // Clamped to the content. The overshoot is how far a finger has pulled beyond the end; it is only shown.
    void setOffset(int offset, int overshoot = 0);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    QWidget* _content;
    int _offset = 0;
};

class SidewaysScrollView;

// A row of a table list: a content view, an accessory at its right, a highlight and a separator below. It
// takes no input: the list does.
class TableCell : public QWidget {
public:
    enum class Accessory { none, disclosureIndicator, checkmark };

    // Keeps a right-aligned value off the edge of the window.
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
    // What a sideways gesture on the row scrolls; may be null.
    virtual SidewaysScrollView* sidewaysScrollView() const { return nullptr; }

    // The row that the list shows, or last showed, in this cell; -1 before the first.
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
